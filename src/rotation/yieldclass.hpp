#pragma once

#include <vector>

namespace arbolex::rotation {

/// Yield class from the mean annual increments of a projection, in row order:
/// once the MAI has culminated (an entry not greater than the maximum so
/// far), the maximum rounded to a whole number and made even (an odd class is
/// raised by 1); 0 while the MAI is still rising.
int yieldClass(const std::vector<double> &meanAnnualIncrements);

} // namespace arbolex::rotation

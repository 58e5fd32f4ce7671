#include "rotation/yieldclass.hpp"

#include <cmath>

namespace arbolex::rotation {

int yieldClass(const std::vector<double> &meanAnnualIncrements) {
    bool culminated = false;
    double maximum = 0.0;
    bool first = true;
    for (const double mai : meanAnnualIncrements) {
        if (first || mai > maximum) {
            maximum = mai;
            first = false;
        } else {
            culminated = true;
        }
    }
    if (!culminated) {
        return 0;
    }
    const auto rounded = static_cast<int>(std::nearbyint(maximum));
    return rounded % 2 == 1 ? rounded + 1 : rounded;
}

} // namespace arbolex::rotation

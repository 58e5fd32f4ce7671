#pragma once

#include "work/projectiontable.hpp"

#include <vector>

namespace arbolex::work {

/// The rows whose increments describe the rotation, in table order: growth
/// rows (and rows of a failed projection), one per age. A thinning row, or a
/// final cut after a thinning, repeats the MAI of the growth row at its age.
std::vector<int> incrementRows(const ProjectionTable &table);

} // namespace arbolex::work

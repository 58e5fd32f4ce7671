#pragma once

// The basal-area and diameter conversions live beside the rotation, where the
// estate reader shares them with the windows.

#include "rotation/standmath.hpp"

namespace arbolex::workflow {

using rotation::basalAreaFromDbh;
using rotation::dbhFromBasalArea;
using rotation::kPi;
using rotation::truncateToTenth;

} // namespace arbolex::workflow

#include "rotation/standmath.hpp"

#include <cmath>

namespace arbolex::rotation {

float dbhFromBasalArea(float &basalArea, float &stocking) {
    if (stocking <= 0.0f) {
        stocking = 1.0f;
    }
    if (basalArea < 0.0f) {
        basalArea = 0.0f;
    }
    return static_cast<float>(200.0 * std::sqrt(basalArea / (double{stocking} * kPi)));
}

float basalAreaFromDbh(float stocking, float dbh) {
    return static_cast<float>(double{stocking} * kPi * double{dbh} * dbh / 40000.0);
}

float truncateToTenth(float value) {
    return static_cast<float>(std::trunc(10.0 * double{value}) / 10.0);
}

} // namespace arbolex::rotation

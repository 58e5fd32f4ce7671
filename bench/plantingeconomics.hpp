#pragma once

// The money of the rotation and estate benchmarks.

#include "rotation/rotation.hpp"

namespace arbolex::bench {

/// Long-term prices of the shipped list and the costs of a planting, at 3 %.
inline rotation::Economics plantingEconomics() {
    return {3.0,
            1500.0,
            20.0,
            {3.85, 7.9, 11.75, 15.3, 18.6, 22.95, 27.1, 30.4, 33.85, 37.2, 40.35, 43.5, 47.05}};
}

} // namespace arbolex::bench

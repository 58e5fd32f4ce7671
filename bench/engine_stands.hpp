#pragma once

// Stands shared by the engine benchmarks.

#include "engine/grow.hpp"

#include <cstdint>
#include <vector>

namespace arbolex::bench {

/// A sub-compartment as the forester types it.
struct Stand {
    std::int16_t model;
    float age;       ///< years
    float stocking;  ///< stems/ha
    float height;    ///< top height, m
    float basalArea; ///< m²/ha
};

/// A young Sitka spruce stand: the everyday case of the projection.
inline constexpr Stand kTypicalStand{0, 15.0f, 2500.0f, 7.0f, 20.0f};

/// Makes `stand`'s model active and prepares the transition for its site index.
inline bool prepare(engine::Grow &grow, const Stand &stand) {
    grow.GetModel(stand.model);
    if (!grow.SiteIndex(stand.age, stand.height)) {
        return false;
    }
    grow.TM(grow.siteIndex());
    return true;
}

/// `count` varied stands over every catalogue model: ages 10-30, stocking
/// 800-4000, top heights 4-14 m, basal areas 8-40 m²/ha, drawn by a fixed
/// linear congruential sequence so every run projects the same stands.
inline std::vector<Stand> variedStands(std::size_t count) {
    std::uint64_t seed = 0x2545F4914F6CDD1Dull;
    auto uniform = [&seed](float low, float high) {
        seed = seed * 6364136223846793005ull + 1442695040888963407ull;
        const auto unit = static_cast<float>(seed >> 40) / static_cast<float>(1u << 24);
        return low + (high - low) * unit;
    };
    std::vector<Stand> stands;
    stands.reserve(count);
    for (std::size_t i = 0; i < count; ++i) {
        Stand s{};
        s.model = static_cast<std::int16_t>(i % engine::kModelCount);
        s.age = static_cast<float>(static_cast<int>(uniform(10.0f, 31.0f)));
        s.stocking = uniform(800.0f, 4000.0f);
        s.height = uniform(4.0f, 14.0f);
        s.basalArea = uniform(8.0f, 40.0f);
        stands.push_back(s);
    }
    return stands;
}

} // namespace arbolex::bench

#pragma once

// Valuation by assortments: a harvest divided by the engine's assortment
// calculation into the top-diameter classes of the assortment report
// (7-14, 14-20 and >20 cm: pulpwood, pallet wood and sawlog), each class
// sold at its own price per m³ (docs/economics.md).

#include "engine/assortment.hpp"

#include <array>
#include <string_view>

namespace arbolex::rotation {

/// Number of top-diameter classes an assortment price list prices.
inline constexpr int kAssortmentClassCount = 3;

/// Standing prices of the classes 7-14, 14-20 and >20 cm, euro per m³.
using AssortmentPriceList = std::array<double, kAssortmentClassCount>;

/// Volume of a harvest in each class, m³/ha, in the order of the prices.
using AssortmentVolumes = std::array<float, kAssortmentClassCount>;

/// Captions of the classes, as the assortment report names them.
inline constexpr std::array<std::string_view, kAssortmentClassCount> kAssortmentClassCaptions = {
    "7-14 cm", "14-20 cm", ">20 cm"};

/// Divides the `volume` (m³/ha) of a harvest of `basalArea` (m²/ha) and
/// `stocking` (stems/ha) into the classes of the assortment report with the
/// model's volume-ratio function `ratio`: the classes keep the shares of a
/// stand of that basal area and stocking and add up to `volume`. A harvest
/// without basal area or stems has no diameter to divide by: every class 0.
AssortmentVolumes divideHarvest(float volume, float basalArea, float stocking,
                                engine::VolumeRatioCoefficients ratio);

/// Revenue, euro/ha: each class's volume times its price.
double assortmentRevenue(const AssortmentVolumes &volumes, const AssortmentPriceList &prices);

} // namespace arbolex::rotation

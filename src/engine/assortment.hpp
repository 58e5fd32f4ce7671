#pragma once

// Types of the assortment calculation (AsmtG, AsmtH, AsmtB of module Grow):
// how the standing volume to 7 cm top of a stand divides into top-diameter
// classes. The method is written down in docs/assortments.md.

#include <array>
#include <cstddef>
#include <optional>
#include <span>

namespace arbolex::engine {

/// Most classes one calculation divides a stand into: the five user categories.
inline constexpr std::size_t kMaxAssortmentClasses = 5;

/// A class as the forester names it, in whole centimetres of top diameter.
struct AssortmentCategory {
    /// Small-end diameter, cm.
    float smallEnd = 0.0f;
    /// Big-end diameter, cm; 0 sets no upper limit.
    float bigEnd = 0.0f;
};

/// The three fixed classes 7-14, 14-20 and >20 cm as integer-centimetre
/// classes (7 to 14, 15 to 20, 21 and over), so that AsmtG widens them to the
/// neighbouring bounds 6.5–14.499, 14.5–20.499 and 20.5 and over.
inline constexpr std::array<AssortmentCategory, 3> kFixedClasses{AssortmentCategory{7.0f, 14.0f},
                                                                 AssortmentCategory{15.0f, 20.0f},
                                                                 AssortmentCategory{21.0f, 0.0f}};

/// Class bounds set by AsmtG, cm of top diameter.
struct AssortmentBounds {
    std::size_t count = 0;
    /// Lower bound of each class, cm.
    std::array<double, kMaxAssortmentClasses> lower{};
    /// Upper bound of each class, cm; infinite when the class has no upper limit.
    std::array<double, kMaxAssortmentClasses> upper{};
};

/// Stand volume ratios that AsmtH evaluates at the class bounds: the share of
/// the stand's stem volume that lies in stem sections thicker than a bound.
struct AssortmentRatios {
    /// Ratio at each class's lower bound.
    std::array<double, kMaxAssortmentClasses> lower{};
    /// Ratio just above each class's upper bound (0 without upper limit).
    std::array<double, kMaxAssortmentClasses> upper{};
    /// Ratio at 6.5 cm, the bound of the stand volume to 7 cm top.
    double reference = 0.0;
};

/// The coefficients of the tree volume-ratio function exp(b1 · (t/d)^b2).
struct VolumeRatioCoefficients {
    double b1 = 0.0;
    double b2 = 0.0;
};

/// What AsmtB gives back: the volume of the stand to 7 cm top and of each class.
struct Assortment {
    /// Standing volume to 7 cm top, m³/ha (GetV7).
    float volume = 0.0f;
    std::size_t count = 0;
    /// Volume of each class, m³/ha.
    std::array<float, kMaxAssortmentClasses> classVolume{};

    /// Share of class `i` in the volume to 7 cm top, percent (0 without volume).
    float percent(std::size_t i) const {
        return volume > 0.0f ? static_cast<float>(100.0 * double{classVolume[i]} / double{volume})
                             : 0.0f;
    }
};

/// Lower bound of the stand volume to 7 cm top, cm.
inline constexpr double kAssortmentFloor = 6.5;

/// The stand ratio S(t) for a stand of quadratic mean diameter `dq` (cm) and
/// a tree volume-ratio function `ratio`, at a top diameter `t` (cm). Standard
/// library only, no checks: the caller gives dq > 0 and t > 0.
double StandVolumeRatio(double dq, double t, VolumeRatioCoefficients ratio);

/// The volume-ratio function an entry's assortment coefficients A1..A38
/// select (docs/assortments.md): A7 and A8 when A1 is 0, the catalogue's
/// reference conifer function otherwise.
VolumeRatioCoefficients VolumeRatioFor(std::span<const float, 38> a);

/// AsmtG without its report: the class bounds of `categories` (the fixed
/// classes when there are none), or std::nullopt for categories AsmtG refuses.
std::optional<AssortmentBounds> ClassBounds(std::span<const AssortmentCategory> categories);

/// AsmtH without its report: the stand ratios at every bound for a stand of
/// basal area G (m²/ha) and stocking N (stems/ha), or std::nullopt when the
/// stand has no basal area or stems or a ratio is not a finite number.
std::optional<AssortmentRatios> StandRatios(float G, float N, const AssortmentBounds &bounds,
                                            VolumeRatioCoefficients ratio);

/// AsmtB's division of `volume` (m³/ha) among the classes of `bounds` by
/// their ratios: V · (S(lower) − S(upper + 0.001)) / S(6.5); every class 0
/// when the volume is 0 or less.
Assortment DivideVolume(float volume, const AssortmentBounds &bounds,
                        const AssortmentRatios &ratios);

} // namespace arbolex::engine

#pragma once

#include <array>

namespace arbolex::work {

/// What one row of the projection table was printed from. A growth row holds
/// the standing crop and no removal; a thinning row holds the stand after the
/// thinning in its standing fields and the removal in its removal fields, so
/// the stand before the thinning is always standing + removed.
struct RowRecord {
    /// Age, years.
    float age = 0.0f;
    /// Top height, m.
    float topHeight = 0.0f;
    /// Basal area standing, m²/ha.
    float basalArea = 0.0f;
    /// Stocking standing, stems/ha.
    float stocking = 0.0f;
    /// Volume standing, m³/ha.
    float volume = 0.0f;
    /// Mean DBH standing, cm.
    float dbh = 0.0f;
    /// Basal area removed by a thinning at this age, m²/ha (> 0 marks a thinned row).
    float removedBasalArea = 0.0f;
    /// Stocking removed, stems/ha.
    float removedStocking = 0.0f;
    /// Volume removed, m³/ha (kept as an absolute value).
    float removedVolume = 0.0f;
    /// Mean DBH after a thinning, cm, truncated to one decimal.
    float postDbh = 0.0f;

    bool isThinned() const { return removedBasalArea > 0.0f; }
    bool operator==(const RowRecord &) const = default;
};

/// Indices of the per-row numbers that summaries, increments and cash flows read.
enum RowNumber : int {
    kNumAge = 0,           ///< the row's age, years
    kNumVolume = 1,        ///< volume per ha before any removal on this row
    kNumRemovedVolume = 2, ///< volume removed on this row, m³/ha (0 on a growth row)
    kNumCai = 3,           ///< current annual increment, m³/ha/yr
    kNumMai = 4,           ///< mean annual increment, m³/ha/yr
};
using RowNumbers = std::array<double, 5>;

} // namespace arbolex::work

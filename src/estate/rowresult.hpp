#pragma once

// What the estate makes of one row: the rotation's figures for the
// sub-compartment, or why the row could not be grown.

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace arbolex::estate {

enum class RowStatus {
    kOk,
    /// A value is missing or wrong, or the model cannot follow the regime.
    kRefused,
    /// The engine failed on the row (its log line is in `logLines`).
    kFailed,
};

/// Status word of the results table.
const char *statusWord(RowStatus status);

/// A harvest of the row in the forecast: whole litres and cents for the
/// sub-compartment's area, so that any grouping of rows sums exactly.
struct ForecastEntry {
    int year = 0;
    /// Litres (dm³) to 7 cm top.
    std::int64_t thinningLitres = 0;
    std::int64_t finalCutLitres = 0;
    std::int64_t revenueCents = 0;
    /// Net carbon removal of the year and the carbon units issued in it,
    /// whole kg CO₂e for the sub-compartment's area.
    std::int64_t carbonRemovalKg = 0;
    std::int64_t carbonUnitsKg = 0;
};

struct RowResult {
    RowStatus status = RowStatus::kOk;
    /// Why the row was refused or failed.
    std::string message;
    /// The engine's failure lines of this row, for the error log.
    std::vector<std::string> logLines;

    /// Model label ("SS - (Thinned)"); empty when the model was not readable.
    std::string modelLabel;
    /// Species: the label's first word ("SS").
    std::string species;
    /// Area, ha.
    double areaHa = 0.0;
    /// Site index, m.
    float siteIndex = 0.0f;
    /// Yield class over the stand's path to the model's age limit.
    int yieldClass = 0;
    int thinningCount = 0;
    /// Volume of all thinnings, m³/ha.
    double thinningVolume = 0.0;
    /// Final-cut age, years, and its calendar year.
    int finalCutAge = 0;
    int finalCutYear = 0;
    /// Standing volume at the final cut, m³/ha.
    float finalCutVolume = 0.0f;
    /// Largest mean annual increment up to the final cut, m³/ha/year.
    double maxMai = 0.0;
    /// Mean annual increment at the final cut, m³/ha/year.
    double finalCutMai = 0.0;
    /// Money, euro/ha.
    std::optional<double> npv;
    std::optional<double> lev;
    std::optional<double> forestValue;
    /// Carbon in the trees today and their long-term average stock over the
    /// rotation, t CO₂e/ha; the carbon units of the rotation, t CO₂e/ha; and
    /// the NPV of the carbon money, euro/ha (0 unless carbon counts).
    bool hasCarbon = false;
    double carbonStock = 0.0;
    double carbonLongTermAverage = 0.0;
    double carbonUnits = 0.0;
    std::optional<double> npvCarbon;

    /// The row's harvests and carbon by calendar year.
    std::vector<ForecastEntry> harvests;

    /// What the sink made of the row on the thread that grew it (its results
    /// line), so that only the writing is left for the thread that writes.
    std::string prepared;
};

} // namespace arbolex::estate

#pragma once

// How sure the value of a rotation is: a tornado of NPV and LEV for one
// factor moved at a time, and Monte Carlo draws of the price level, the
// interest rate and the cost level. The stand is grown once; only the
// valuation is redrawn (docs/economics.md).

#include "rotation/rotation.hpp"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace arbolex::rotation {

/// One bar of the tornado: NPV and LEV with the factor at its low and high end.
struct TornadoBar {
    /// "timber prices ±20 %", "interest rate ±1 point", "costs ±20 %", "volume ±10 %".
    std::string factor;
    std::optional<double> npvLow;
    std::optional<double> npvHigh;
    std::optional<double> levLow;
    std::optional<double> levHigh;
};

/// The tornado of the rotation felled at `rotation` on `path`. Volume moves
/// every harvest's volume and mean tree in proportion (the stems stay), so a
/// mean tree may change its price class.
std::vector<TornadoBar> tornado(const GrowthPath &path, int rotation, const Economics &economics);
/// The same for `harvests` (the rotation of a projection table).
std::vector<TornadoBar> tornado(const RotationHarvests &harvests, const Economics &economics);

struct MonteCarloSettings {
    int draws = 10000;
    std::uint64_t seed = 1;
    /// Standard deviation of the logarithm of the price level (log-normal,
    /// median 1).
    double priceSpread = 0.2;
    /// Interest rate drawn uniformly from rateLow to rateHigh, percent, above 0.
    double rateLow = 2.0;
    double rateHigh = 5.0;
    /// Standard deviation of the logarithm of the cost level (0: costs fixed).
    double costSpread = 0.0;
    /// Bars of the NPV histogram.
    int bins = 20;
};

struct Percentiles {
    double p5 = 0.0;
    double p50 = 0.0;
    double p95 = 0.0;
};

struct MonteCarloResult {
    Percentiles npv;
    Percentiles lev;
    /// Share of the draws whose NPV is below 0.
    double probabilityNpvBelowZero = 0.0;
    /// Draws of NPV in `bins` equal bars from npvLowest to npvHighest.
    std::vector<int> histogram;
    double npvLowest = 0.0;
    double npvHighest = 0.0;
};

/// Draws the valuation of the rotation felled at `rotation` on `path`
/// `settings.draws` times; the same seed gives the same result on every
/// platform (the generator and the distributions are written out here).
MonteCarloResult monteCarlo(const GrowthPath &path, int rotation, const Economics &economics,
                            const MonteCarloSettings &settings);
/// The same for `harvests` (the rotation of a projection table).
MonteCarloResult monteCarlo(const RotationHarvests &harvests, const Economics &economics,
                            const MonteCarloSettings &settings);

} // namespace arbolex::rotation

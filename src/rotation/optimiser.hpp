#pragma once

// The regime optimiser: over the first thinning age, the years between
// thinnings, the volume per thinning (or none) and the rotation age, the
// regimes of the largest LEV, NPV or total production, within a largest
// removal per thinning and a smallest residual stocking. Exhaustive on a
// coarse grid, then refined around the best; deterministic (docs/economics.md).

#include "rotation/rotation.hpp"

#include <functional>
#include <vector>

namespace arbolex::rotation {

/// What the optimiser maximises: the LEV, the NPV (both with the carbon money
/// when carbon counts), the total production, or the long-term average
/// carbon stock.
enum class Objective { kLev, kNpv, kVolume, kCarbon };

/// Progress of long work: the fraction done in, "keep going?" out.
using Progress = std::function<bool(double fraction)>;

struct OptimiserSettings {
    Objective objective = Objective::kLev;
    /// Largest share of the standing volume one thinning may remove.
    double maxRemovalShare = 0.35;
    /// Smallest stocking a thinning may leave, stems/ha: about a final crop.
    /// Without it, frequent heavy thinnings drive the thinning response to a
    /// few stems per ha, far outside the stands the models were fitted to.
    float minStocking = 400.0f;
    /// How many regimes to report.
    int top = 5;
    /// The coarse grid: first thinning ages (empty: every third year from the
    /// present age to 10 years before the age limit), years between thinnings
    /// and volumes per thinning, m³/ha. The regime without thinning is always
    /// searched; thinnings only on a thinned model.
    std::vector<int> thinFrom;
    std::vector<int> thinEvery = {3, 5, 7, 10};
    std::vector<float> thinVolume = {20.0f, 40.0f, 60.0f, 80.0f};
    /// Refine around the best regimes of the grid (whole years, 5 m³/ha).
    bool refine = true;
};

/// A regime and its final cut, with its figures.
struct Candidate {
    /// The thinnings, with thinUntil the last one before the final cut; no
    /// thinning when `regime.thins()` is false.
    Regime regime;
    int rotation = 0;
    double npv = 0.0;
    double lev = 0.0;
    /// Total production, m³/ha: standing volume at the final cut and the thinnings.
    double volume = 0.0;
    /// Long-term average carbon stock, t CO₂e/ha; filled when carbon counts
    /// or is the objective.
    double carbonStock = 0.0;
    /// The objective's figure.
    double score = 0.0;
};

struct OptimiserResult {
    /// The best regimes, best first (at most `top`).
    std::vector<Candidate> best;
    /// How many regimes were grown.
    int regimesGrown = 0;
    /// False when the progress callback asked to stop.
    bool completed = true;
};

/// Searches the regimes of `stand` with `grow`. A regime the stand cannot carry
/// is left out; std::nullopt and `failure` when the stand itself cannot be grown.
std::optional<OptimiserResult> optimise(engine::Grow &grow, const Stand &stand,
                                        const Economics &economics,
                                        const OptimiserSettings &settings, GrowthFailure &failure,
                                        const Progress &progress = {});

/// The figures of `regime` felled at `rotation` on `path`, as the optimiser scores them.
Candidate scoreRotation(const GrowthPath &path, const Regime &regime, int rotation,
                        const Economics &economics, Objective objective);

} // namespace arbolex::rotation

// The economic questions of one stand: the regime optimiser's whole search, by
// mean-tree prices or by assortments (the whole `arbolex-cli optimise` process
// under 50 ms, scripts/bench-programs.sh) and 10,000 Monte Carlo draws of a
// rotation's valuation (target under 20 ms).
#include "engine_stands.hpp"
#include "plantingeconomics.hpp"

#include "rotation/optimiser.hpp"
#include "rotation/uncertainty.hpp"

#include "dirtystate.hpp"

#include <benchmark/benchmark.h>

namespace arbolex::bench {
namespace {

const rotation::Stand kStand{kTypicalStand.model, kTypicalStand.age, kTypicalStand.stocking,
                             kTypicalStand.height, kTypicalStand.basalArea};

/// The planting's economics, every harvest valued by assortments at the
/// shipped class prices.
rotation::Economics byAssortments() {
    rotation::Economics e = plantingEconomics();
    e.valuation = rotation::Valuation::kAssortments;
    e.assortmentPrices = {10.0, 28.0, 48.0};
    return e;
}

void optimiseOneStand(benchmark::State &state, const rotation::Economics &e) {
    engine::Grow grow;
    const rotation::OptimiserSettings settings;
    int grown = 0;
    for (auto _ : state) {
        dirtyIfAsked();
        rotation::GrowthFailure failure;
        const auto result = rotation::optimise(grow, kStand, e, settings, failure);
        benchmark::DoNotOptimize(result);
        grown = result ? result->regimesGrown : 0;
    }
    state.counters["regimes"] = grown;
}

// The default search of the optimiser: the coarse grid, then its refinement.
void BM_OptimiseOneStand(benchmark::State &state) {
    optimiseOneStand(state, plantingEconomics());
}
ARBOLEX_BENCHMARK(BM_OptimiseOneStand, ->Unit(benchmark::kMillisecond));

// The same search valued by assortments: every harvest of every candidate is
// divided into its classes.
void BM_OptimiseOneStandByAssortments(benchmark::State &state) {
    optimiseOneStand(state, byAssortments());
}
ARBOLEX_BENCHMARK(BM_OptimiseOneStandByAssortments, ->Unit(benchmark::kMillisecond));

// 10,000 draws of price level, rate and cost level over one grown rotation.
void BM_MonteCarlo10000(benchmark::State &state) {
    engine::Grow grow;
    rotation::GrowthFailure failure;
    const rotation::GrowthPath path =
        *rotation::growPath(grow, kStand, {20, 5, 40.0f, 35}, failure);
    const rotation::Economics e = plantingEconomics();
    rotation::MonteCarloSettings settings;
    settings.draws = 10000;
    settings.costSpread = 0.1;
    for (auto _ : state) {
        dirtyIfAsked();
        benchmark::DoNotOptimize(rotation::monteCarlo(path, 48, e, settings));
    }
}
ARBOLEX_BENCHMARK(BM_MonteCarlo10000, ->Unit(benchmark::kMillisecond));

} // namespace
} // namespace arbolex::bench

// Thinning response: the Newton solve for a prescribed residual volume.
#include "engine_stands.hpp"

#include "dirtystate.hpp"

#include <benchmark/benchmark.h>

namespace arbolex::bench {
namespace {

using engine::Grow;

// A typical thinning: a quarter of the standing volume removed from the
// typical stand.
void BM_NewtonVolumeThinning(benchmark::State &state) {
    Grow grow;
    const Stand s = kTypicalStand;
    prepare(grow, s);
    const float residualVolume = 0.75f * grow.GetV7(s.basalArea, s.stocking, s.height);
    float nr = 0.0f;
    float gr = 0.0f;
    for (auto _ : state) {
        dirtyIfAsked();
        grow.NEWTON(s.stocking, s.basalArea, s.height, residualVolume, nr, gr);
        benchmark::DoNotOptimize(nr);
        benchmark::DoNotOptimize(gr);
    }
}
ARBOLEX_BENCHMARK(BM_NewtonVolumeThinning);

} // namespace
} // namespace arbolex::bench

#pragma once

// Each benchmark of numeric work runs twice: as it is, and named "/dirty"
// with the upper halves of the vector registers left in use before the run,
// as the programs run it after Qt's string hash (docs/performance.md). A
// benchmark binary loads no Qt, so without the second run it would never see
// what a user's machine sees; the two figures should match.

#include "engine/vectorstate.hpp"

#include <benchmark/benchmark.h>

namespace arbolex::bench {

template <void (*Run)(benchmark::State &)> void dirtied(benchmark::State &state) {
    engine::dirtyUpperVectorState();
    Run(state);
}

} // namespace arbolex::bench

/// BENCHMARK(name) and its run in the dirtied state, named "name/dirty", with
/// the same settings: ARBOLEX_BENCHMARK(BM_X, ->Unit(benchmark::kMillisecond)).
#define ARBOLEX_BENCHMARK(name, ...)                                                               \
    BENCHMARK(name) __VA_ARGS__;                                                                   \
    BENCHMARK_TEMPLATE(dirtied, name)->Name(#name "/dirty") __VA_ARGS__

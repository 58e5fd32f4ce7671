#pragma once

// Each benchmark of numeric work runs twice: as it is, and named "/dirty"
// with the upper halves of the vector registers left in use at every pass, as
// Qt's string hash leaves them between two calls of a window into the engine
// (docs/performance.md). A benchmark binary loads no Qt, so without the second
// run it would never see what a user's machine sees; the two figures should
// match wherever the work goes through a guarded entry.

#include "engine/vectorstate.hpp"

#include <benchmark/benchmark.h>

namespace arbolex::bench {

/// True while a /dirty run is under way on this thread.
inline bool &dirtyRun() {
    thread_local bool dirty = false;
    return dirty;
}

/// At the start of a pass: in a /dirty run, leaves the state in use again.
inline void dirtyIfAsked() {
    if (dirtyRun()) {
        engine::dirtyUpperVectorState();
    }
}

template <void (*Run)(benchmark::State &)> void dirtied(benchmark::State &state) {
    dirtyRun() = true;
    Run(state);
    dirtyRun() = false;
}

} // namespace arbolex::bench

/// BENCHMARK(name) and its run in the dirtied state, named "name/dirty", with
/// the same settings: ARBOLEX_BENCHMARK(BM_X, ->Unit(benchmark::kMillisecond)).
#define ARBOLEX_BENCHMARK(name, ...)                                                               \
    BENCHMARK(name) __VA_ARGS__;                                                                   \
    BENCHMARK_TEMPLATE(dirtied, name)->Name(#name "/dirty") __VA_ARGS__

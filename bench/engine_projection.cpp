// Projection: one step against the bare cost of its powers, a 50-year
// projection of one stand, and a whole estate of stands.
#include "engine_stands.hpp"

#include "dirtystate.hpp"

#include <benchmark/benchmark.h>

#include <cmath>
#include <string>
#include <vector>

namespace arbolex::bench {
namespace {

using engine::Grow;
using engine::StandState;

/// Years in a rotation projected by 1-year steps.
constexpr int kRotationYears = 50;

/// Reports the time per step of a benchmark whose every pass covers a rotation.
void reportPerStep(benchmark::State &state) {
    state.counters["step"] =
        benchmark::Counter(kRotationYears, benchmark::Counter::kIsIterationInvariantRate |
                                               benchmark::Counter::kInvert);
}

// One projection step: forward transform, modal step, complete inverse and the
// volume of the new state. Timed over the 50 steps of a rotation; the `step`
// counter gives the time per step, in which the rate, the step factors and the
// start state's volume, computed once per projection, weigh in at a fiftieth.
/// Projects the typical stand over a rotation by 1-year steps, once a pass.
void projectRotations(benchmark::State &state) {
    Grow grow;
    const Stand s = kTypicalStand;
    prepare(grow, s);
    std::vector<StandState> states;
    states.reserve(kRotationYears + 1);
    for (auto _ : state) {
        dirtyIfAsked();
        states.clear();
        grow.PROJ(s.age, s.basalArea, s.stocking, s.height, s.age + kRotationYears, 1.0f, states);
        benchmark::DoNotOptimize(states.data());
        benchmark::ClobberMemory();
    }
}

void BM_ProjectionStep(benchmark::State &state) {
    projectRotations(state);
    reportPerStep(state);
}
ARBOLEX_BENCHMARK(BM_ProjectionStep);

/// The transcendental calls that the rotation of BM_ProjectionStep makes, with
/// the same arguments: per step 7 powers forward and 7 inverse; once per
/// projection the rate (a power and a logarithm) and the step factors (an
/// exponential and 3 powers).
struct RotationCalls {
    std::vector<double> base;
    std::vector<double> exponent;
    double expArgument = 0.0;
    double logArgument = 0.0;
};

RotationCalls rotationCalls() {
    Grow grow;
    const Stand s = kTypicalStand;
    prepare(grow, s);
    std::vector<StandState> states;
    grow.PROJ(s.age, s.basalArea, s.stocking, s.height, s.age + kRotationYears, 1.0f, states);
    auto S = [&grow](int i) {
        return double{grow.S(i)};
    };

    RotationCalls c;
    auto add = [&c](double base, double exponent) {
        c.base.push_back(base);
        c.exponent.push_back(exponent);
    };
    const double si = grow.siteIndex();
    c.logArgument = 1.0 - std::pow(si, S(1)) / S(6);
    c.expArgument = grow.rate(grow.siteIndex());
    add(si, S(1));
    const double e = std::exp(c.expArgument);
    add(e, S(2));
    add(e, S(3));
    add(e, -1.0);
    for (std::size_t k = 0; k + 1 < states.size(); ++k) {
        const double g = states[k].basalArea;
        const double n = states[k].stocking;
        const double h = states[k].topHeight;
        for (const auto &[x, i] :
             {std::pair{g, 11}, {n, 13}, {h, 15}, {g, 12}, {n, 14}, {h, 16}, {h, 1}}) {
            add(x, S(i));
        }
        // The inverse transform's bases are the forward transform of the next state.
        const double g1 = states[k + 1].basalArea;
        const double n1 = states[k + 1].stocking;
        const double h1 = states[k + 1].topHeight;
        const double p1 = std::pow(g1, S(11)) * std::pow(n1, S(13)) * std::pow(h1, S(15));
        const double p2 = std::pow(g1, S(12)) * std::pow(n1, S(14)) * std::pow(h1, S(16));
        const double p3 = std::pow(h1, S(1));
        for (const auto &[x, i] :
             {std::pair{p2, 19}, {p1, 17}, {p3, 21}, {p2, 20}, {p1, 18}, {p3, 22}}) {
            add(x, S(i));
        }
        add(p3, 1.0 / S(1));
    }
    return c;
}

// The floor under a step: the same pow/exp/log calls on the same numbers and
// nothing else, over the same rotation as BM_ProjectionStep. A step should cost
// at most a quarter as much again.
void BM_ProjectionStepBaseline(benchmark::State &state) {
    RotationCalls c = rotationCalls();
    for (auto _ : state) {
        dirtyIfAsked();
        // Make the compiler read the arguments afresh on every pass.
        benchmark::DoNotOptimize(c.base.data());
        benchmark::DoNotOptimize(c.exponent.data());
        benchmark::ClobberMemory();
        double sum = std::log(c.logArgument) + std::exp(c.expArgument);
        for (std::size_t k = 0; k < c.base.size(); ++k) {
            sum += std::pow(c.base[k], c.exponent[k]);
        }
        benchmark::DoNotOptimize(sum);
    }
    reportPerStep(state);
}
ARBOLEX_BENCHMARK(BM_ProjectionStepBaseline);

// A rotation for one stand: 50 years by 1-year steps, 51 states.
void BM_Projection50Years(benchmark::State &state) {
    projectRotations(state);
}
ARBOLEX_BENCHMARK(BM_Projection50Years, ->Unit(benchmark::kMicrosecond));

// An estate: 100,000 varied stands over all 22 models, each through the site
// index, the transition and a 50-year projection by 1-year steps. One state
// vector is reused, so memory stays that of one projection.
void BM_Estate100kStands50Years(benchmark::State &state) {
    const std::vector<Stand> stands = variedStands(100'000);
    std::vector<Grow> engines(engine::kModelCount);
    for (std::int16_t m = 0; m < engine::kModelCount; ++m) {
        engines[static_cast<std::size_t>(m)].GetModel(m);
    }
    std::vector<StandState> states;
    states.reserve(kRotationYears + 1);
    std::size_t projected = 0;
    std::size_t failed = 0;
    for (auto _ : state) {
        dirtyIfAsked();
        projected = 0;
        failed = 0;
        float checksum = 0.0f;
        for (const Stand &s : stands) {
            Grow &grow = engines[static_cast<std::size_t>(s.model)];
            if (!grow.SiteIndex(s.age, s.height)) {
                ++failed;
                continue;
            }
            grow.TM(grow.siteIndex());
            states.clear();
            if (!grow.PROJ(s.age, s.basalArea, s.stocking, s.height, s.age + kRotationYears, 1.0f,
                           states)) {
                ++failed;
            }
            projected += states.size();
            checksum += states.back().volume;
        }
        benchmark::DoNotOptimize(checksum);
    }
    state.SetLabel(std::to_string(projected) + " states, " + std::to_string(failed) +
                   " stands failed");
}
ARBOLEX_BENCHMARK(BM_Estate100kStands50Years, ->Unit(benchmark::kMillisecond)->Iterations(2));

} // namespace
} // namespace arbolex::bench

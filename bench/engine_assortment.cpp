// Assortments: one report's calculation, and the three fixed classes of every
// row of a 50-year projection table.
#include "engine_stands.hpp"

#include "dirtystate.hpp"

#include <benchmark/benchmark.h>

#include <vector>

namespace arbolex::bench {
namespace {

using engine::Assortment;
using engine::AssortmentCategory;
using engine::Grow;
using engine::StandState;

/// A stand at first thinning: the everyday report.
constexpr Stand kReportStand{0, 25.0f, 1800.0f, 13.0f, 32.0f};

void BM_AssortmentReport(benchmark::State &state) {
    Grow grow;
    prepare(grow, kReportStand);
    const Stand s = kReportStand;
    Assortment a;
    for (auto _ : state) {
        dirtyIfAsked();
        grow.AsmtB(s.basalArea, s.stocking, s.height, {}, a);
        benchmark::DoNotOptimize(a);
    }
}
ARBOLEX_BENCHMARK(BM_AssortmentReport, ->Unit(benchmark::kMicrosecond));

void BM_AssortmentUserCategories(benchmark::State &state) {
    Grow grow;
    prepare(grow, kReportStand);
    const Stand s = kReportStand;
    const std::vector<AssortmentCategory> categories{
        {7.0f, 13.0f}, {14.0f, 17.0f}, {18.0f, 24.0f}, {25.0f, 0.0f}, {10.0f, 20.0f}};
    Assortment a;
    for (auto _ : state) {
        dirtyIfAsked();
        grow.AsmtB(s.basalArea, s.stocking, s.height, categories, a);
        benchmark::DoNotOptimize(a);
    }
}
ARBOLEX_BENCHMARK(BM_AssortmentUserCategories, ->Unit(benchmark::kMicrosecond));

void BM_AssortmentTable50Years(benchmark::State &state) {
    Grow grow;
    const Stand s = kTypicalStand;
    prepare(grow, s);
    std::vector<StandState> rows;
    grow.PROJ(s.age, s.basalArea, s.stocking, s.height, s.age + 50.0f, 1.0f, rows);
    std::vector<Assortment> classes(rows.size());
    for (auto _ : state) {
        dirtyIfAsked();
        for (std::size_t i = 0; i < rows.size(); ++i) {
            grow.AsmtB(rows[i].basalArea, rows[i].stocking, rows[i].topHeight, {}, classes[i]);
        }
        benchmark::DoNotOptimize(classes.data());
        benchmark::ClobberMemory();
    }
    state.counters["rows"] = static_cast<double>(rows.size());
}
ARBOLEX_BENCHMARK(BM_AssortmentTable50Years, ->Unit(benchmark::kMicrosecond));

} // namespace
} // namespace arbolex::bench

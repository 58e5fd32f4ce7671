// The work of one estate row (read, check, grow a thinned rotation, fell it
// at 50, value it, write its results line) against its floor: the growth of
// the same stands under the same regimes over the same years, which no estate
// can do without. A row grows its stand to the model's age limit whatever the
// final cut (the yield class is read over the whole path), and so does the
// floor. scripts/bench.sh prints the ratio.
#include "plantingeconomics.hpp"

#include "estate/csvfile.hpp"
#include "estate/estaterun.hpp"
#include "estate/resulttable.hpp"
#include "estate/rowevaluator.hpp"

#include "dirtystate.hpp"

#include <benchmark/benchmark.h>

#include <string>
#include <vector>

namespace arbolex::bench {
namespace {

const std::vector<std::string> kHeader = {"id",         "model",       "age",     "stocking",
                                          "top_height", "basal_area",  "area_ha", "thin_from",
                                          "thin_every", "thin_volume", "rotation"};

/// A few hundred plausible rows over the thinned models.
std::vector<estate::RowValues> rows() {
    std::vector<estate::RowValues> out;
    const int models[] = {0, 2, 4, 6, 8, 10, 12, 14, 16, 19, 21};
    for (int i = 0; i < 330; ++i) {
        const int age = 15 + i % 5;
        out.push_back({std::string("S").append(std::to_string(i)), std::to_string(models[i % 11]),
                       std::to_string(age), std::to_string(2200 + 10 * (i % 30)),
                       std::to_string(8 + i % 4), "24.5", "3.2", "20", "5", "30", "50"});
    }
    return out;
}

estate::EstateDefaults defaults() {
    estate::EstateDefaults d;
    d.economics = plantingEconomics();
    // As the command line runs an estate without a carbon price.
    d.economics.carbonAccount = false;
    d.year = 2026;
    return d;
}

estate::Layout layout() {
    std::string problem;
    return *estate::layoutOf(kHeader, problem);
}

void BM_EstateRowGrown(benchmark::State &state) {
    const estate::Layout l = layout();
    const estate::EstateDefaults d = defaults();
    const std::vector<estate::RowValues> input = rows();
    estate::RowEvaluator evaluator(l, d);
    std::size_t i = 0;
    for (auto _ : state) {
        dirtyIfAsked();
        benchmark::DoNotOptimize(evaluator.evaluate(input[i]));
        i = (i + 1) % input.size();
    }
}
ARBOLEX_BENCHMARK(BM_EstateRowGrown, ->Unit(benchmark::kMicrosecond));

// A whole row as an estate's thread does it: evaluated, then its results
// line made.
void BM_EstateRow(benchmark::State &state) {
    const estate::Layout l = layout();
    const estate::EstateDefaults d = defaults();
    const std::vector<estate::RowValues> input = rows();
    estate::RowEvaluator evaluator(l, d);
    std::vector<std::string> values;
    std::size_t i = 0;
    for (auto _ : state) {
        dirtyIfAsked();
        const estate::RowResult result = evaluator.evaluate(input[i]);
        estate::resultValues(l, static_cast<long long>(i) + 2, input[i], result, values);
        benchmark::DoNotOptimize(estate::csvLine(values));
        i = (i + 1) % input.size();
    }
}
ARBOLEX_BENCHMARK(BM_EstateRow, ->Unit(benchmark::kMicrosecond));

// The floor of the same rows: their stands grown by the engine under their
// regimes over the years the row grows (projection year by year to the age
// limit and the thinnings' Newton solves), nothing read, valued or written.
void BM_EstateRowGrowth(benchmark::State &state) {
    const estate::Layout l = layout();
    const estate::EstateDefaults d = defaults();
    std::vector<estate::RowPlan> plans;
    for (const estate::RowValues &row : rows()) {
        plans.push_back(std::get<estate::RowPlan>(estate::planRow(l, row, d)));
    }
    engine::Grow grow;
    std::size_t i = 0;
    for (auto _ : state) {
        dirtyIfAsked();
        const estate::RowPlan &plan = plans[i];
        rotation::GrowthFailure failure;
        benchmark::DoNotOptimize(rotation::growPath(grow, plan.stand, plan.regime, failure));
        i = (i + 1) % plans.size();
    }
}
ARBOLEX_BENCHMARK(BM_EstateRowGrowth, ->Unit(benchmark::kMicrosecond));

void BM_EstateRowWritten(benchmark::State &state) {
    const estate::Layout l = layout();
    const estate::EstateDefaults d = defaults();
    const std::vector<estate::RowValues> input = rows();
    estate::RowEvaluator evaluator(l, d);
    const estate::RowResult result = evaluator.evaluate(input[0]);
    std::vector<std::string> values;
    for (auto _ : state) {
        estate::resultValues(l, 2, input[0], result, values);
        benchmark::DoNotOptimize(values.data());
    }
}
BENCHMARK(BM_EstateRowWritten)->Unit(benchmark::kMicrosecond);

} // namespace
} // namespace arbolex::bench

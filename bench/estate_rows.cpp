// The work of one estate row (read, check, grow a thinned rotation to its
// final cut at 50, value it, write its results line) and the same rows
// through the estate's thread pool: the estate's speed without the files.
#include "plantingeconomics.hpp"

#include "estate/estaterun.hpp"
#include "estate/resulttable.hpp"
#include "estate/rowevaluator.hpp"

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
        benchmark::DoNotOptimize(evaluator.evaluate(input[i]));
        i = (i + 1) % input.size();
    }
}
BENCHMARK(BM_EstateRowGrown)->Unit(benchmark::kMicrosecond);

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

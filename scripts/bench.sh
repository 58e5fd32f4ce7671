#!/usr/bin/env bash
# Runs every *_bench executable in BIN_DIR and prints its results, then the
# cost of one projection step relative to the bare pow/exp/log calls it makes
# (CPU time, so that other work on a shared machine does not skew the ratio).
# Usage: scripts/bench.sh BIN_DIR [benchmark options, e.g. --benchmark_filter=Newton]
set -euo pipefail

if [[ $# -lt 1 || ! -d "$1" ]]; then
    echo "usage: $0 BIN_DIR [benchmark options]" >&2
    exit 2
fi
bin_dir=$1
shift

results=$(mktemp -d)
trap 'rm -rf "$results"' EXIT

found=0
for exe in "$bin_dir"/*_bench; do
    [[ -x "$exe" ]] || continue
    found=1
    name=$(basename "$exe")
    echo "== $name"
    "$exe" --benchmark_out="$results/$name.json" --benchmark_out_format=json "$@"
    echo
done
if [[ $found -eq 0 ]]; then
    echo "no *_bench executable in $bin_dir" >&2
    exit 1
fi

# The step ratio is measured on its own: the two step benchmarks, repeated and
# randomly interleaved so that a busy moment or a cold start weighs on both
# alike, compared by their medians.
if [[ -x "$bin_dir/engine_bench" ]]; then
    "$bin_dir/engine_bench" --benchmark_filter='^BM_ProjectionStep' \
        --benchmark_repetitions=9 --benchmark_enable_random_interleaving=true \
        --benchmark_report_aggregates_only=true \
        --benchmark_out="$results/ratio.json" --benchmark_out_format=json >/dev/null
fi

# The median `step` counter (seconds of CPU time per projection step) of a
# benchmark, in nanoseconds (empty when the benchmark did not run).
step_ns() {
    awk -v want="\"$1_median\"," '
        $1 == "\"name\":" { current = $2 }
        $1 == "\"step\":" && current == want { printf "%.1f\n", $2 * 1e9; exit }
    ' "$results/ratio.json" 2>/dev/null
}

step=$(step_ns BM_ProjectionStep)
baseline=$(step_ns BM_ProjectionStepBaseline)
if [[ -n "$step" && -n "$baseline" ]]; then
    awk -v s="$step" -v b="$baseline" 'BEGIN {
        printf "projection step %.1f ns, its pow/exp/log calls alone %.1f ns (medians of 9): ratio %.2f (target <= 1.50)\n",
               s, b, s / b }'
fi

# The estate command over a synthetic estate of a million sub-compartments
# (ESTATE_ROWS to change it, 0 to leave it out).
if [[ "${ESTATE_ROWS:-1000000}" != 0 && -x "$bin_dir/arbolex-cli" ]]; then
    echo
    "$(dirname "$0")/bench-estate.sh" "$bin_dir" "${ESTATE_ROWS:-1000000}"
fi

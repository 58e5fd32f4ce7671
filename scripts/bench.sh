#!/usr/bin/env bash
# Runs every *_bench executable in BIN_DIR and prints its results; then the
# cost of one projection step relative to the bare pow/exp/log calls it makes,
# and of one estate row relative to the growth of its years; then the
# programs as whole processes (scripts/bench-programs.sh) and the estate of a
# million rows (scripts/bench-estate.sh), each against its target.
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

# The ratios are measured on their own: the benchmarks compared, repeated and
# randomly interleaved so that a busy moment or a cold start weighs on both
# alike, compared by their medians (CPU time, so that other work on a shared
# machine does not skew them). Each benchmark of numeric work also runs as
# "/dirty", after the vector state is left as Qt leaves it.
if [[ -x "$bin_dir/engine_bench" ]]; then
    "$bin_dir/engine_bench" --benchmark_filter='^BM_ProjectionStep' \
        --benchmark_repetitions=9 --benchmark_enable_random_interleaving=true \
        --benchmark_report_aggregates_only=true \
        --benchmark_out="$results/ratio.json" --benchmark_out_format=json >/dev/null
fi
if [[ -x "$bin_dir/estate_bench" ]]; then
    "$bin_dir/estate_bench" --benchmark_filter='^BM_EstateRow(Growth)?(/dirty)?$' \
        --benchmark_repetitions=9 --benchmark_enable_random_interleaving=true \
        --benchmark_report_aggregates_only=true \
        --benchmark_out="$results/row.json" --benchmark_out_format=json >/dev/null
fi

# The median of a benchmark's `step` counter (seconds of CPU time per
# projection step) or of its CPU time per iteration, in nanoseconds (empty
# when the benchmark did not run).
median_ns() {
    awk -v want="\"$2_median\"," -v field="$3" '
        $1 == "\"name\":" { current = $2; value = "" }
        current != want { next }
        field == "step" && $1 == "\"step\":" { printf "%.1f\n", $2 * 1e9; exit }
        field == "cpu_time" && $1 == "\"cpu_time\":" { value = $2; sub(",", "", value) }
        field == "cpu_time" && $1 == "\"time_unit\":" && value != "" {
            scale = $2 ~ /us/ ? 1e3 : $2 ~ /ms/ ? 1e6 : $2 ~ /ns/ ? 1 : 1e9
            printf "%.1f\n", value * scale; exit
        }
    ' "$results/$1.json" 2>/dev/null
}

step=$(median_ns ratio BM_ProjectionStep step)
step_dirty=$(median_ns ratio BM_ProjectionStep/dirty step)
baseline=$(median_ns ratio BM_ProjectionStepBaseline step)
baseline_dirty=$(median_ns ratio BM_ProjectionStepBaseline/dirty step)
if [[ -n "$step" && -n "$baseline" ]]; then
    awk -v s="$step" -v sd="$step_dirty" -v b="$baseline" -v bd="$baseline_dirty" 'BEGIN {
        printf "projection step %.1f ns (%.1f ns after Qt left the vector state dirty), its pow/exp/log calls alone %.1f ns (medians of 9): ratio %.2f (target <= 1.25)\n",
               s, sd, b, s / b
        printf "  the same bare calls in the dirty state, unguarded: %.1f ns (%.1f times as long: the penalty the guard avoids)\n",
               bd, bd / b }'
fi

row=$(median_ns row BM_EstateRow cpu_time)
row_dirty=$(median_ns row BM_EstateRow/dirty cpu_time)
growth=$(median_ns row BM_EstateRowGrowth cpu_time)
if [[ -n "$row" && -n "$growth" ]]; then
    awk -v r="$row" -v rd="$row_dirty" -v g="$growth" 'BEGIN {
        printf "estate row %.2f us (%.2f us dirty), the growth of its years alone %.2f us (medians of 9): ratio %.2f (target <= 1.50)\n",
               r / 1000, rd / 1000, g / 1000, r / g }'
fi

# The programs as users run them, whole processes.
echo
"$(dirname "$0")/bench-programs.sh" "$bin_dir"

# The estate command over a synthetic estate of a million sub-compartments
# (ESTATE_ROWS to change it, 0 to leave it out).
if [[ "${ESTATE_ROWS:-1000000}" != 0 && -x "$bin_dir/arbolex-cli" ]]; then
    echo
    "$(dirname "$0")/bench-estate.sh" "$bin_dir" "${ESTATE_ROWS:-1000000}"
fi

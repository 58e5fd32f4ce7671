#!/usr/bin/env bash
# The estate at scale: a synthetic estate of ROWS sub-compartments (default
# 1,000,000) with a thinning regime and a 50-year rotation, run by
# arbolex-cli estate on 1 and on 2 threads. Prints the wall time, the speed-up
# and the peak memory of each run against the targets (under 6 s on 2 cores,
# 2 threads at least 1.8 times as fast as 1, peak memory under 200 MB), and
# checks that both runs wrote the same files.
# Usage: scripts/bench-estate.sh BIN_DIR [ROWS]
set -euo pipefail

if [[ $# -lt 1 || ! -x "$1/arbolex-cli" ]]; then
    echo "usage: $0 BIN_DIR [ROWS]" >&2
    exit 2
fi
bin_dir=$1
rows=${2:-1000000}
here=$(cd "$(dirname "$0")" && pwd)

work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
"$here/generate-estate.sh" "$rows" > "$work/estate.csv"

declare -A seconds memory
for threads in 1 2; do
    /usr/bin/time -f "%e %M" -o "$work/time.$threads" \
        "$bin_dir/arbolex-cli" estate "$work/estate.csv" --out "$work/out.$threads" \
        --rotation 50 --rate 3 --threads "$threads" --data-dir "$bin_dir" 2>/dev/null || true
    # The last line: time puts a note of a non-zero exit status before it.
    read -r seconds[$threads] memory[$threads] < <(tail -n 1 "$work/time.$threads")
done
for file in subcompartments.csv forecast.csv errors.csv; do
    cmp -s "$work/out.1/$file" "$work/out.2/$file" || echo "DIFFERENT: $file for 1 and 2 threads"
done
rows_out=$(($(wc -l < "$work/out.2/subcompartments.csv") - 1))
errors=$(($(wc -l < "$work/out.2/errors.csv") - 1))
awk -v n="$rows_out" -v e="$errors" -v s1="${seconds[1]}" -v s2="${seconds[2]}" \
    -v m1="${memory[1]}" -v m2="${memory[2]}" 'BEGIN {
    printf "estate of %d sub-compartments (%d not grown):\n", n, e
    printf "  1 thread  %6.2f s, peak memory %5.1f MB\n", s1, m1 / 1024
    printf "  2 threads %6.2f s, peak memory %5.1f MB (target < 6 s, < 200 MB)\n", s2, m2 / 1024
    printf "  speed-up of 2 threads %.2f (target >= 1.80)\n", s1 / s2
}'

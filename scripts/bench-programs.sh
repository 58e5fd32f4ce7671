#!/usr/bin/env bash
# The programs users run, timed as whole processes (the median of several runs,
# wall time from start to exit), against their targets:
#   arbolex-cli optimise for one stand, and 10,000 Monte Carlo draws
#   (arbolex-cli uncertainty);
#   arbolex-cli estate over a synthetic estate of ESTATE_CHECK_ROWS rows
#   (default 100,000) on 1 and 2 threads;
#   the desktop program under the offscreen platform: start to main window,
#   then the grow command 10 -> 60 and the economics window's first figures
#   (runner scripts bench/scripts/desktop-*.arb through arbolex --script,
#   whose `time` lines time each from the command to the windows drawn).
# Each command-line run is repeated with the vector state cleared before every
# pow, exp and log by a preloaded library (clearvectorstate.so, built with the
# benchmarks): a program that guards its numeric work gains at most 10 % from
# it; one that does not gains several times (docs/performance.md).
# Usage: scripts/bench-programs.sh BIN_DIR
set -euo pipefail

if [[ $# -lt 1 || ! -x "$1/arbolex-cli" ]]; then
    echo "usage: $0 BIN_DIR" >&2
    exit 2
fi
bin_dir=$(cd "$1" && pwd)
here=$(cd "$(dirname "$0")" && pwd)
runs=${RUNS:-11}
preload="$bin_dir/clearvectorstate.so"

work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT

# The median wall time, ms, of RUNS runs of a command (its output discarded).
median_ms() {
    local times=()
    for ((i = 0; i < runs; ++i)); do
        local start=$EPOCHREALTIME
        "$@" >/dev/null 2>&1 || true
        local end=$EPOCHREALTIME
        times+=("$(awk -v s="$start" -v e="$end" 'BEGIN { printf "%.1f", (e - s) * 1000 }')")
    done
    printf '%s\n' "${times[@]}" | sort -n | awk '{ t[NR] = $1 } END { print t[int((NR + 1) / 2)] }'
}

# "name  X ms (target < T ms)" (no target when T is "-") and, with the preload
# library, the same run with the state cleared externally and what that gains.
report() {
    local name=$1 target=$2
    shift 2
    local plain cleared
    plain=$(median_ms "$@")
    if [[ -f "$preload" ]]; then
        cleared=$(median_ms env LD_PRELOAD="$preload" "$@")
        awk -v n="$name" -v p="$plain" -v c="$cleared" -v t="$target" 'BEGIN {
            goal = t == "-" ? "" : sprintf(" (target < %s ms)", t)
            printf "  %-36s %8.1f ms%s; state cleared externally %8.1f ms: %+.0f %% faster (target <= 10 %%)\n",
                   n, p, goal, c, (p / c - 1) * 100 }'
    else
        awk -v n="$name" -v p="$plain" -v t="$target" 'BEGIN {
            goal = t == "-" ? "" : sprintf(" (target < %s ms)", t)
            printf "  %-36s %8.1f ms%s\n", n, p, goal }'
    fi
}

stand=(--model 0 --age 15 --stocking 2500 --height 7 --basal-area 20)
regime=(--thin-from 20 --thin-every 5 --thin-volume 40 --thin-until 35)
cli="$bin_dir/arbolex-cli"
echo "whole processes (median of $runs runs; $(grep -m1 'model name' /proc/cpuinfo | cut -d: -f2 | sed 's/^ //'), $(nproc) cores, load $(cut -d' ' -f1 /proc/loadavg)):"
report "arbolex-cli optimise, one stand" 50 \
    "$cli" optimise "${stand[@]}" "${regime[@]}" --rate 3 --establishment-cost 1500 \
    --data-dir "$bin_dir"
report "arbolex-cli uncertainty, 10000 draws" 20 \
    "$cli" uncertainty "${stand[@]}" "${regime[@]}" --rate 3 --draws 10000 --seed 1 \
    --price-spread 0.2 --rate-range 2 4 --cost-spread 0.1 --data-dir "$bin_dir"

rows=${ESTATE_CHECK_ROWS:-100000}
if [[ "$rows" != 0 ]]; then
    "$here/generate-estate.sh" "$rows" >"$work/estate.csv"
    runs_before=$runs
    runs=3
    for threads in 1 2; do
        report "arbolex-cli estate, $rows rows, $threads thr" "-" \
            "$cli" estate "$work/estate.csv" --out "$work/out" --rotation 50 --rate 3 \
            --threads "$threads" --data-dir "$bin_dir"
    done
    runs=$runs_before
fi

desktop="$bin_dir/arbolex"
if [[ -x "$desktop" ]]; then
    data="$work/desktop"
    mkdir -p "$data"
    cp "$bin_dir"/*.qdm "$bin_dir"/*.dat "$data"/ 2>/dev/null || true
    run_desktop() {
        QT_QPA_PLATFORM=offscreen XDG_CONFIG_HOME="$data/config" "$desktop" --no-intro \
            --data-dir "$data" "$@"
    }
    startup=$(median_ms run_desktop --quit-when-shown)
    # Each timing run prints its own figure ("TIME<TAB>line<TAB>ms"); the median of 5 of each.
    scripts=$(cd "$here/../bench/scripts" && pwd)
    for ((i = 0; i < 5; ++i)); do
        for stage in grow economics; do
            run_desktop --script "$scripts/desktop-$stage.arb" 2>&1 >/dev/null |
                awk -F'\t' -v s="$stage" '$1 == "TIME" { print s, $3 }' >>"$work/windows.txt" || true
        done
    done
    awk -v s="$startup" '
        $1 == "grow" { grow[++g] = $2 }
        $1 == "economics" { econ[++e] = $2 }
        function median(a, n,    i, j, t) {
            for (i = 1; i <= n; ++i) for (j = i + 1; j <= n; ++j) if (a[j] < a[i]) { t = a[i]; a[i] = a[j]; a[j] = t }
            return n ? a[int((n + 1) / 2)] : -1
        }
        END {
            printf "  %-36s %8.1f ms (target < 300 ms)\n", "desktop start to main window", s
            printf "  %-36s %8.1f ms (target < 16 ms)\n", "desktop grow 10 -> 60 by 1 year", median(grow, g)
            printf "  %-36s %8.1f ms (target < 16 ms)\n", "desktop economics, first figures", median(econ, e)
        }' "$work/windows.txt"
fi

#!/usr/bin/env bash
# Runs every libFuzzer harness of BUILD_DIR (built by `make fuzz`) in turn,
# each over a working copy of its seed corpus in tests/fuzz/corpus/, and
# prints the figures of each run. The options go to every harness, e.g.
# -max_total_time=20 or -runs=1000000. Stops at the first harness that finds a
# crash, a hang or a leak; its log and the input that did it stay in BUILD_DIR.
# Usage: scripts/fuzz.sh BUILD_DIR LIBFUZZER_OPTION...
# FUZZERS="NAME..." in the environment runs only those harnesses.
set -euo pipefail
build=$(cd "${1:?usage: scripts/fuzz.sh BUILD_DIR LIBFUZZER_OPTION...}" && pwd)
shift
seeds=$(cd "$(dirname "$0")/../tests/fuzz/corpus" && pwd)

# A small quarantine and no fill of new blocks: several times faster on
# harnesses that open many files, and still every fault a harness can meet.
export ASAN_OPTIONS=${ASAN_OPTIONS:-max_malloc_fill_size=0:quarantine_size_mb=4:malloc_context_size=5}

shopt -s nullglob
harnesses=("$build"/bin/fuzz_*)
if [[ -n ${FUZZERS:-} ]]; then
    harnesses=()
    for name in $FUZZERS; do harnesses+=("$build/bin/fuzz_$name"); done
fi
[[ ${#harnesses[@]} -gt 0 ]] || { echo "error: no harness in $build/bin" >&2; exit 1; }

for harness in "${harnesses[@]}"; do
    name=${harness##*/fuzz_}
    work="$build/fuzz/$name"
    log="$build/fuzz/$name.log"
    mkdir -p "$work"
    start=$(date +%s.%N)
    if ! (cd "$build/fuzz" && "$harness" "$@" -timeout=10 -rss_limit_mb=2048 \
            -artifact_prefix="$name-" "$work" "$seeds/$name") >"$log" 2>&1; then
        tail -n 40 "$log"
        echo "fuzz_$name FAILED: see $log and the input $build/fuzz/$name-*" >&2
        exit 1
    fi
    runs=$(grep -o 'Done [0-9]* runs' "$log" | grep -o '[0-9]*' || echo 0)
    awk -v name="fuzz_$name" -v runs="$runs" -v start="$start" -v end="$(date +%s.%N)" \
        'BEGIN { s = end - start; printf "%-18s %9d runs in %6.1f s, %7.0f exec/s\n", name, runs, s, runs / s }'
done

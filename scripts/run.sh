#!/usr/bin/env bash
# Starts ARBOLEX from BIN_DIR with the data folder shipped beside it. Without a
# display it says so and runs a sample script through the headless runner.
set -euo pipefail
bin=${1:?usage: scripts/run.sh BIN_DIR}
here=$(cd "$(dirname "$0")" && pwd)

if [[ -n "${DISPLAY:-}${WAYLAND_DISPLAY:-}" && -x "$bin/arbolex" ]]; then
    exec "$bin/arbolex"
fi

echo "No display found (neither DISPLAY nor WAYLAND_DISPLAY is set):"
echo "running the sample script $here/sample.arb through the headless runner instead."
echo
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT
cp "$bin"/*.qdm "$bin"/IFPRM1.dat "$scratch"/ 2>/dev/null || true
"$bin/arbolex-cli" run "$here/sample.arb" --data-dir "$scratch"

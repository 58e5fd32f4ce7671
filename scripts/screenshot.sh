#!/usr/bin/env bash
# Screenshots of the desktop program as a user sees it, under a virtual X
# server: the model choice window, the main window as it opens, and one shot
# for every runner script in scripts/shots/ (each puts the windows into the
# state its first comment line describes: a grown stand, a thinning preview,
# a rotation's final cut, summary and cash flow, the charts, the economics
# window's pages, the assortment reports, documents and the estate).
#
#   scripts/screenshot.sh [OUTPUT_FOLDER] [SHOT...]   (default /tmp/shots, every shot)
#
# ARBOLEX_EXE names the program (default build/bin/arbolex). Each shot works on
# a fresh copy of data/ and a throw-away settings folder, so neither the
# shipped data nor the user's settings change. A shot of a window that opens
# over the main window also saves that window alone as NAME-window.png.
set -euo pipefail

root=$(cd "$(dirname "$0")/.." && pwd)
exe=${ARBOLEX_EXE:-$root/build/bin/arbolex}
out=${1:-/tmp/shots}
shift || true
screen=${ARBOLEX_SCREEN:-1400x900x24}
settle=${ARBOLEX_SETTLE:-4}

[ -x "$exe" ] || { echo "no program at $exe (build the target arbolex first)" >&2; exit 1; }
mkdir -p "$out"
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT

# The window a shot also saves alone, by the start of its title.
window_of() {
    case "$1" in
    thin-*) echo "Thinning at age" ;;
    npv) echo "Net Present Value" ;;
    timber-prices) echo "Timber Prices" ;;
    assort-prices) echo "Assortment Prices" ;;
    carbon-price) echo "Carbon Price" ;;
    assort-user) echo "User assortment categories" ;;
    assort-growth | assort-thinning | assort-user-report) echo "Assortment at age" ;;
    economics-table) echo "" ;;
    economics-*) echo "Economics of the rotation" ;;
    estate-table | estate-chart | estate-marked) echo "Estate" ;;
    *) echo "" ;;
    esac
}

# Files some scripts open: a damaged document, an estate with two bad rows.
prepare() {
    printf '{\n    "format": "ARBOLEX sub-compartment",\n    "version": 1,\n    "model": 0,\n    "table": {"rows": [\n' \
        >/tmp/arbolex-damaged.arbolex
    cat "$root/data/examples/estate.csv" - >"$work/estate-marked.csv" <<'ROWS'
GL-04,Glenmore,0,15,lots,7.0,20.0,,3.0,20,5,40,,
AR-04,Ardnish,3,95,1500,20.0,40.0,,2.0,0,,,,
ROWS
}

# shoot NAME ARGS...: starts the program with ARGS in the work folder, waits,
# saves NAME.png (the whole screen) and, for a window of window_of, that
# window alone as NAME-window.png.
shoot() {
    local name=$1
    shift
    rm -rf "$work/data" "$work/config"
    cp -r "$root/data" "$work/data"
    mkdir -p "$work/config"
    (cd "$work" && XDG_CONFIG_HOME="$work/config" SHOT="$out/$name.png" \
        WINDOW_TITLE="$(window_of "$name")" SETTLE=${SETTLE:-$settle} \
        xvfb-run -a -s "-screen 0 $screen" bash -c '
            "$0" "$@" &
            pid=$!
            sleep "$SETTLE"
            import -window root "$SHOT"
            if [ -n "$WINDOW_TITLE" ]; then
                id=$(xwininfo -root -tree | grep -F "$WINDOW_TITLE" | head -n 1 | awk "{print \$1}")
                [ -n "$id" ] && import -window "$id" "${SHOT%.png}-window.png"
            fi
            kill "$pid" 2>/dev/null || true
            wait "$pid" 2>/dev/null || true
        ' "$exe" --data-dir "$work/data" "$@")
    echo "$out/$name.png"
}

prepare
if [ $# -eq 0 ]; then
    shoot model-choice
    shoot main-start --no-intro
fi
for script in "$root"/scripts/shots/*.arb; do
    name=$(basename "$script" .arb)
    if [ $# -gt 0 ] && [[ " $* " != *" $name "* ]]; then
        continue
    fi
    # The economics window's optimiser runs a few seconds before its table shows.
    case "$name" in economics-optimiser | economics-applied | economics-table) extra=4 ;; *) extra=0 ;; esac
    SETTLE=$((settle + extra)) shoot "$name" --no-intro --script "$script"
done

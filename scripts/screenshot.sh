#!/usr/bin/env bash
# Screenshots of the desktop program as a user sees it, under a virtual X
# server: the model choice window, the main window as it opens, the main
# window after growing a young Sitka spruce stand (model 0, age 15, 2500
# stems/ha, 7 m, 20 m²/ha, to 50 by 5), the thinning window opened on the
# same stand grown to 30 before and after previewing a removal of 60 m³/ha
# (the whole screen, and the thinning window alone), and the main window
# after a thinning loop: 30 m³/ha at 20, then every 5 years until 50; a
# whole rotation (age 15, 2500 stems/ha, 9 m, 22 m²/ha, 10 ha, thinned by
# 50 m³/ha at 30, grown to 60): the final cut with its question, the summary,
# and the net present value window; and the timber prices window as Show
# Timber Prices opens it (the whole screen, and the window alone); and the
# assortment prices window with changes allowed.
#
#   scripts/screenshot.sh [OUTPUT_FOLDER]      (default /tmp/shots)
#
# ARBOLEX_EXE names the program (default build-ui/bin/arbolex). Each run works
# on a fresh copy of data/ and a throw-away settings folder, so neither the
# shipped data nor the user's settings change.
set -euo pipefail

root=$(cd "$(dirname "$0")/.." && pwd)
exe=${ARBOLEX_EXE:-$root/build-ui/bin/arbolex}
out=${1:-/tmp/shots}
screen=${ARBOLEX_SCREEN:-1400x900x24}
settle=${ARBOLEX_SETTLE:-4}

[ -x "$exe" ] || { echo "no program at $exe (build the target arbolex first)" >&2; exit 1; }
mkdir -p "$out"
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT

# shoot NAME ARGS...: starts the program with ARGS, waits, saves NAME.png
# (the whole screen). With WINDOW_TITLE set, the top-level window whose title
# contains it is saved as well, alone, as NAME-window.png.
shoot() {
    local name=$1
    shift
    rm -rf "$work/data" "$work/config"
    cp -r "$root/data" "$work/data"
    mkdir -p "$work/config"
    XDG_CONFIG_HOME="$work/config" xvfb-run -a -s "-screen 0 $screen" \
        bash -c '
            "$0" "$@" &
            pid=$!
            sleep "$SETTLE"
            import -window root "$SHOT"
            if [ -n "${WINDOW_TITLE:-}" ]; then
                id=$(xwininfo -root -tree | grep -F "$WINDOW_TITLE" | head -n 1 | awk "{print \$1}")
                [ -n "$id" ] && import -window "$id" "${SHOT%.png}-window.png"
            fi
            kill "$pid" 2>/dev/null || true
            wait "$pid" 2>/dev/null || true
        ' "$exe" --data-dir "$work/data" "$@"
    echo "$out/$name.png"
    if [ -n "${WINDOW_TITLE:-}" ] && [ -f "$out/$name-window.png" ]; then
        echo "$out/$name-window.png"
    fi
}
export SETTLE=$settle
export WINDOW_TITLE=

export SHOT="$out/model-choice.png"
shoot model-choice
export SHOT="$out/main-start.png"
shoot main-start --no-intro
export SHOT="$out/main-grown.png"
shoot main-grown --no-intro --demo-grow

export WINDOW_TITLE="Thinning at age"
export SHOT="$out/thin-open.png"
rm -f "${SHOT%.png}-window.png"
shoot thin-open --no-intro --demo-thin open
export SHOT="$out/thin-preview.png"
rm -f "${SHOT%.png}-window.png"
shoot thin-preview --no-intro --demo-thin preview
export WINDOW_TITLE=
export SHOT="$out/main-thin-loop.png"
shoot main-thin-loop --no-intro --demo-thin loop

export SHOT="$out/main-final-cut.png"
shoot main-final-cut --no-intro --demo-rotation finalcut
export SHOT="$out/main-summary.png"
shoot main-summary --no-intro --demo-rotation summary
export WINDOW_TITLE="Net Present Value"
export SHOT="$out/npv.png"
rm -f "${SHOT%.png}-window.png"
shoot npv --no-intro --demo-rotation npv
export WINDOW_TITLE="Timber Prices"
export SHOT="$out/timber-prices.png"
rm -f "${SHOT%.png}-window.png"
shoot timber-prices --no-intro --demo-prices
export WINDOW_TITLE=
# Assortments: the report of a growth row at 35, the report of the trees a
# 60 m³/ha thinning at 30 removes, the user categories window and a report
# over the categories in use, and the main window with the assortment rows
# of an accepted thinning.
export WINDOW_TITLE="Assortment at age"
for stage in growth thinning user-report; do
    export SHOT="$out/assort-$stage.png"
    rm -f "${SHOT%.png}-window.png"
    shoot "assort-$stage" --no-intro --demo-assort "$stage"
done
export WINDOW_TITLE="User assortment categories"
export SHOT="$out/assort-user.png"
rm -f "${SHOT%.png}-window.png"
shoot assort-user --no-intro --demo-assort user
export WINDOW_TITLE=
export SHOT="$out/main-assort-rows.png"
shoot main-assort-rows --no-intro --demo-assort rows

# Charts: a rotation thinned by 40 m³/ha at 25 and every 5 years until 45,
# felled at 60, its cash flow computed with planting and cleaning costs; the
# main window with each chart beside the table.
for chart in stand increments cashflow; do
    export SHOT="$out/charts-$chart.png"
    shoot "charts-$chart" --no-intro --demo-charts --demo-chart-tab "$chart"
done
# Economics: the economics window on the rotation above at 3 % with costs of
# establishment and upkeep: the value of the regime and NPV, LEV and MAI by
# rotation age, the optimiser's five best regimes, the best of them applied to
# the table, the tornado and the Monte Carlo histogram.
export WINDOW_TITLE="Economics of the rotation"
for stage in rotation optimiser applied sensitivity montecarlo; do
    export SHOT="$out/economics-$stage.png"
    rm -f "${SHOT%.png}-window.png"
    shoot "economics-$stage" --no-intro --demo-economics "$stage"
done
export WINDOW_TITLE=
export SHOT="$out/economics-table.png"
shoot economics-table --no-intro --demo-economics table
# The assortment prices window, opened with changes allowed.
export WINDOW_TITLE="Assortment Prices"
export SHOT="$out/assort-prices.png"
rm -f "${SHOT%.png}-window.png"
shoot assort-prices --no-intro --demo-assort-prices
export WINDOW_TITLE=

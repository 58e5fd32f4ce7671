#!/usr/bin/env bash
# Installs the build into a scratch prefix and checks what a user of the
# installed program meets: every file in its place, a desktop entry, metainfo
# and MIME type that their tools accept, the versions, and a data folder in the
# user's data location that the first start fills from the installed defaults
# and that no later start overwrites.
# Usage: checkinstall.sh CMAKE BUILD_DIR VERSION
set -euo pipefail
cmake=$1
build=$2
version=$3
id=org.arbolex.Arbolex

scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT
prefix=$scratch/usr
fail() {
    echo "FAIL: $*" >&2
    exit 1
}

"$cmake" --install "$build" --prefix "$prefix" >/dev/null
defaults=$prefix/share/arbolex/data
for file in bin/arbolex bin/arbolex-cli \
    share/applications/$id.desktop share/icons/hicolor/scalable/apps/$id.svg \
    share/metainfo/$id.metainfo.xml share/mime/packages/$id.xml \
    share/arbolex/data/CURPRIC.qdm share/arbolex/data/OVRA_PRIC.qdm \
    share/arbolex/data/USRPRIC.qdm share/arbolex/data/AvPRIC_npv.qdm \
    share/arbolex/data/UD_Assort.qdm share/arbolex/data/AssortPrices.qdm share/arbolex/data/Costs.qdm \
    share/arbolex/data/IFPRM1.dat; do
    [[ -e $prefix/$file ]] || fail "$file is not installed"
done

desktop-file-validate "$prefix/share/applications/$id.desktop"
appstreamcli validate-tree --no-net "$prefix" >/dev/null ||
    fail "appstreamcli validate-tree: $(appstreamcli validate-tree --no-net "$prefix")"
update-mime-database "$prefix/share/mime" >/dev/null 2>&1 || fail "update-mime-database refused the MIME type"
grep -q '^[0-9]*:application/x-arbolex:\*\.arbolex$' "$prefix/share/mime/globs2" ||
    fail "*.arbolex is not application/x-arbolex in the MIME database"

[[ $("$prefix/bin/arbolex-cli" --version) == "arbolex-cli $version" ]] ||
    fail "arbolex-cli --version: $("$prefix/bin/arbolex-cli" --version)"
[[ $(QT_QPA_PLATFORM=offscreen "$prefix/bin/arbolex" --version) == "ARBOLEX $version" ]] ||
    fail "arbolex --version: $(QT_QPA_PLATFORM=offscreen "$prefix/bin/arbolex" --version)"

# The first start: the user's data location does not exist yet.
unset ARBOLEX_DATA_DIR
export HOME=$scratch/home XDG_DATA_HOME=$scratch/home/data XDG_CONFIG_HOME=$scratch/home/config
user=$XDG_DATA_HOME/ARBOLEX/ARBOLEX
script=$scratch/script.arb
printf 'set txtFromA 21\nprint txtFromN\n' >"$script"
"$prefix/bin/arbolex-cli" run "$script" >"$scratch/out" || fail "the first run failed"
for file in "$defaults"/*; do
    [[ -f $user/${file##*/} ]] || fail "${file##*/} was not copied to the user's data location"
done
cmp -s "$defaults/OVRA_PRIC.qdm" "$user/OVRA_PRIC.qdm" || fail "OVRA_PRIC.qdm differs from the default"
[[ $(sed -n 2p "$user/IFPRM1.dat" | tr -d '\r') == 21 ]] ||
    fail "the start-up file of the user's data location was not written"
[[ $(ls "$prefix/bin") == $'arbolex\narbolex-cli' ]] || fail "a file was written beside the program"

# A later start keeps the user's own files: prices typed by the user stay.
printf '7.5\r\n' >"$user/USRPRIC.qdm"
for i in $(seq 12); do printf '%s\r\n' "$i" >>"$user/USRPRIC.qdm"; done
rm "$user/UD_Assort.qdm"
"$prefix/bin/arbolex-cli" run "$script" >/dev/null || fail "the second run failed"
[[ $(head -n 1 "$user/USRPRIC.qdm" | tr -d '\r') == 7.5 ]] || fail "the user's prices were overwritten"
cmp -s "$defaults/UD_Assort.qdm" "$user/UD_Assort.qdm" || fail "a lost file was not restored from the defaults"
echo "installed layout, desktop files and user data location: all fine"

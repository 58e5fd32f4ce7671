#!/usr/bin/env bash
# Installs the Debian packages that ARBOLEX needs to build, test and run.
# Idempotent: prints nothing and touches nothing when every package is present.
# Usage: scripts/install-deps.sh [--no-gui | --fuzz]
#   --no-gui  the engine-only build
#   --fuzz    also clang and its libFuzzer and sanitizer runtimes (make fuzz)
set -euo pipefail

# time: /usr/bin/time measures the peak memory of the estate benchmark.
packages=(build-essential cmake ninja-build pkg-config
          libgtest-dev libgmock-dev libbenchmark-dev clang-format time)
if [[ "${1:-}" != "--no-gui" ]]; then
    # desktop-file-utils, appstream and shared-mime-info check the installed
    # desktop entry, metainfo and MIME type in the tests; qt6-charts-dev and
    # qt6-svg-dev draw and export the charts (Qt Charts needs the OpenGL module
    # present to configure); libgdal-dev reads and writes the
    # estate's spreadsheets and GIS layers; poppler-utils turns reports into
    # pages to look at; python3-jsonschema checks the command-line program's
    # JSON against docs/schemas/ in the tests.
    packages+=(qt6-base-dev qt6-multimedia-dev qt6-charts-dev libqt6opengl6-dev qt6-svg-dev libgl-dev
               libgdal-dev poppler-utils python3-jsonschema
               fonts-dejavu-core xvfb xauth
               desktop-file-utils appstream shared-mime-info)
fi
if [[ "${1:-}" == "--fuzz" ]]; then
    packages+=(clang clang-14 libclang-rt-14-dev)
fi

missing=()
for p in "${packages[@]}"; do
    if ! dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q 'install ok installed'; then
        missing+=("$p")
    fi
done
[[ ${#missing[@]} -eq 0 ]] && exit 0

echo "Installing missing packages: ${missing[*]}"
sudo=()
if [[ $(id -u) -ne 0 ]]; then
    command -v sudo >/dev/null || { echo "error: not root and sudo is not available" >&2; exit 1; }
    sudo=(sudo)
fi
export DEBIAN_FRONTEND=noninteractive
"${sudo[@]}" apt-get update -qq
"${sudo[@]}" apt-get install -y -qq --no-install-recommends "${missing[@]}" >/dev/null

#!/bin/sh
# Builds the command-line program, composes an EDID for a 4K television and shows its report.
# usage: scripts/demo.sh [--no-install]
# Needs a Debian 12 machine, and root or sudo if one of the packages below is missing.
set -eu
cd "$(dirname "$0")/.."
. scripts/install_packages.sh

echo 'Building edid-composer and composing an EDID for a 4K television.'
install_packages build-essential cmake ninja-build libtomlplusplus-dev libcli11-dev nlohmann-json3-dev libutfcpp-dev

build() {
  cmake --preset release -DBUILD_TESTING=OFF && cmake --build --preset release
}
mkdir -p build
if ! build >build/demo.log 2>&1; then
  cat build/demo.log >&2
  exit 1
fi

edid_composer=build/release/bin/edid-composer
$edid_composer compose --sink examples/sinks/tv_4k.txt -o build/demo.bin
echo 'Wrote the composed EDID, 256 bytes, to build/demo.bin. Its report:'
echo
$edid_composer print build/demo.bin

#!/bin/sh
# Measures what the operations cost and writes the figures of docs/performance.md.
# usage: scripts/bench.sh [--no-install] [--peer FOLDER] [SINKS]
# SINKS: folder of the EDIDs that the operations are compared with libdisplay-info on; examples/sinks without it.
# FOLDER: source folder of a libdisplay-info with a build in FOLDER/build; Debian's libdisplay-info-dev without it.
# Needs a Debian 12 machine, and root or sudo if one of the packages below is missing.
set -eu
root=$(cd "$(dirname "$0")/.." && pwd)
. "$root"/scripts/install_packages.sh

peer=''
if [ "${1:-}" = --peer ]; then
  peer=$(cd "$2" && pwd)
  shift 2
fi
sinks=$(cd "${1:-$root/examples/sinks}" && pwd)
cd "$root"

echo 'Building and measuring. Figures are steadier on a machine that does nothing else.'
install_packages build-essential cmake ninja-build pkg-config libgtest-dev libgmock-dev libtomlplusplus-dev \
  libcli11-dev nlohmann-json3-dev libutfcpp-dev python3 valgrind

build=build/bench
cmake --preset release -B "$build" -DEDID_COMPOSER_BENCH=ON -DEDID_COMPOSER_PEER="$peer"
cmake --build "$build" --target edid_composer edid_composer_bench edid_composer_cli cost_workloads
"$build"/bin/edid_composer_bench examples/sinks "$build"/results.json

set --
if cmake --build "$build" --target help | grep -q '^edid_composer_peer_comparison:'; then
  cmake --build "$build" --target edid_composer_peer_comparison
  "$build"/bin/edid_composer_peer_comparison "$sinks" "$build"/peer.json
  set -- --peer-results "$build"/peer.json
else
  echo 'The table of goals stays as it is: there is no libdisplay-info (Debian: libdisplay-info-dev, or --peer FOLDER).'
fi
strip -o "$build"/stripped.so "$build"/lib/libedid_composer.so
python3 -B bench/write_page.py --results "$build"/results.json "$@" --library "$build"/stripped.so --build "$build" \
  --page docs/performance.md

#!/bin/sh
# Lets two independent decoders judge what is composed for a folder of sinks, without and with HDMI 2: a newer edid-decode
# than Debian's, and libdisplay-info. Not part of the tests: the caller supplies the decoders' sources and the sinks.
# usage: scripts/judges.sh EDID_DECODE LIBDISPLAY_INFO SINKS
# EDID_DECODE, LIBDISPLAY_INFO: source folders, which stay as they are. SINKS: folder of raw EDIDs.
# The last line says whether HDMI 2 brings a failure that has no explanation; the exit status is 1 then.
# Needs g++, meson and ninja, and a build of the program in build/release, or EDID_COMPOSER set to one.
set -eu
if [ $# -ne 3 ]; then
  sed -n '4,6s/^# //p' "$0" >&2
  exit 2
fi
edid_decode=$(realpath "$1") libdisplay_info=$(realpath "$2") sinks=$(realpath "$3")
cd "$(dirname "$0")/.."

mkdir -p build/judges
build_judges() {
  # Its own build file is for a larger tree.
  g++ -O1 -w -D__HAS_I2C_DEV__ -DPACKAGE_VERSION='"given"' -o build/judges/edid-decode "$edid_decode"/*.cpp
  [ -d build/judges/libdisplay-info ] || meson setup build/judges/libdisplay-info "$libdisplay_info"
  ninja -C build/judges/libdisplay-info
}
if ! build_judges >build/judges/build.log 2>&1; then
  cat build/judges/build.log >&2
  exit 1
fi
exec python3 tests/independent/judges.py --program "${EDID_COMPOSER:-build/release/bin/edid-composer}" \
  --judge 'build/judges/edid-decode -c' \
  --judge 'build/judges/libdisplay-info/di-edid-decode/di-edid-decode' "$sinks"

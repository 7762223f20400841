#!/bin/sh
# Builds the library and its tests for other machines, runs them with qemu-user, compares what the library puts out with
# what it puts out on x86-64, and writes the table of docs/cross-building.md. Takes a quarter of an hour of two processors
# for each target.
# usage: scripts/test_targets.sh [--no-install] [TARGET...]
# TARGET: a GNU triplet; without one, all of the table. The table is written when all of them were tested.
# Needs a Debian 12 machine (x86-64), and root or sudo if one of the packages below is missing.
set -eu
cd "$(dirname "$0")/.."
. scripts/install_packages.sh

all='x86_64-linux-gnu aarch64-linux-gnu arm-linux-gnueabihf i686-linux-gnu s390x-linux-gnu x86_64-linux-musl'
targets=${*:-$all}
compositions=1000
echo "Building and testing for: $targets"
install_packages build-essential cmake ninja-build python3 googletest libtomlplusplus-dev libcli11-dev \
  nlohmann-json3-dev libutfcpp-dev g++-aarch64-linux-gnu g++-arm-linux-gnueabihf g++-i686-linux-gnu \
  g++-s390x-linux-gnu musl-tools qemu-user

# Headers that are the same everywhere, apart from those of this machine's C library.
packages=$PWD/build/targets/packages
rm -rf "$packages"
for package in libtomlplusplus-dev libcli11-dev nlohmann-json3-dev libutfcpp-dev; do
  dpkg -L "$package" | grep -E '/(include|cmake)/' | while read -r file; do
    # Some name the width of the machine that they were packed on as a condition, though there is nothing but headers.
    case $file in *ConfigVersion.cmake) continue ;; esac
    [ ! -f "$file" ] || install -D -m 644 "$file" "$packages$file"
  done
done

programs='unit_tests limits_without_assertions_tests end_to_end_tests robustness_tests thread_tests property_tests
golden_tests config_store_tests explain_tests'
library_seeds='replay_base_block replay_extension replay_print replay_compose replay_encode'
host_seeds='replay_store replay_hex_text replay_explain'

# test_target TRIPLET: builds, runs, and leaves the outputs and the log of its tests in its folder.
test_target() {
  target=$1
  build=build/targets/$target
  cmake -S . -B "$build" -G Ninja -DCMAKE_BUILD_TYPE=RelWithDebInfo --toolchain "$PWD"/tests/targets/toolchain.cmake \
    -DEDID_COMPOSER_TARGET="$target" -DEDID_COMPOSER_PACKAGES="$packages" -DEDID_COMPOSER_GOOGLETEST=/usr/src/googletest
  case $target in
    *-musl) built="$library_seeds target_outputs" ;; # See tests/targets/musl_cxx.sh for what can be run.
    *) built="edid_composer config_store_c_host $programs $library_seeds $host_seeds target_outputs" ;;
  esac
  # shellcheck disable=SC2086 # one word each
  cmake --build "$build" --target $built
  run='^fuzz\.'
  case $target in
    *-musl) run='^fuzz\.replay_(base_block|extension|print|compose|encode)$' ;;
    *) run="^($(echo "$programs" | tr ' \n' '||')|config_store_c_host)\$|$run|^shape\.(exported|undefined|needed|version)" ;;
  esac
  EDID_COMPOSER_PROPERTY_RUNS=100 ctest --test-dir "$build" -R "$run" --no-tests=error --output-on-failure
  emulator=$(sed -n 's/^EDID_COMPOSER_EMULATOR:INTERNAL=//p' "$build"/CMakeCache.txt | tr ';' ' ')
  # shellcheck disable=SC2086 # the emulator and its options
  $emulator "$build"/bin/target_outputs "$compositions" >"$build"/outputs.txt
  library=$build/lib/libedid_composer.so
  [ ! -f "$library" ] || "$target"-strip -o "$build"/stripped.so "$library"
}

tested=''
for target in x86_64-linux-gnu $targets; do
  # That one, with which the others are compared, may be named as well.
  case " $tested " in *" $target "*) continue ;; esac
  test_target "$target"
  tested="$tested $target"
done

page=''
[ "$targets" != "$all" ] || page='--page docs/cross-building.md'
# shellcheck disable=SC2086 # one word each
exec python3 -B tests/targets/table.py --builds build/targets $page $tested

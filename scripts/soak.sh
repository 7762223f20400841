#!/bin/sh
# The long runs: each fuzz target for a while (default 30 minutes), more random properties and texts, and the tests of the
# library under valgrind.
# usage: scripts/soak.sh [--no-install] [SECONDS PER FUZZ TARGET] [TARGET...]
set -eu
cd "$(dirname "$0")/.."
. scripts/install_packages.sh

seconds=${1:-1800}
[ $# -gt 0 ] && shift
all_targets=$(find fuzz/targets -name '*.cpp' | sed 's/.*fuzz_\(.*\)\.cpp/\1/' | sort | tr '\n' ' ')
targets=${*:-$all_targets}
echo "Fuzzing ($targets) for $seconds seconds each, then random properties and valgrind."
install_packages build-essential cmake ninja-build clang libclang-rt-14-dev python3 libgtest-dev libgmock-dev \
  libtomlplusplus-dev libcli11-dev nlohmann-json3-dev libutfcpp-dev valgrind

cmake --preset fuzz
for target in $targets; do
  cmake --build --preset fuzz --target "fuzz_$target"
done
# A sink of 32,768 bytes, and the settings and configuration before it.
longest_input=36864
corpus=build/fuzz/corpus
findings=build/fuzz/findings
for target in $targets; do
  mkdir -p "$corpus/$target" "$findings/$target"
  echo "fuzz_$target"
  build/fuzz/bin/"fuzz_$target" -max_total_time="$seconds" -timeout=10 -max_len="$longest_input" -print_final_stats=1 \
    -artifact_prefix="$findings/$target/" "$corpus/$target" "fuzz/seeds/$target" 2>"$corpus/$target.log" || {
    tail -40 "$corpus/$target.log" >&2
    exit 1
  }
  grep -E 'DONE|number_of_executed_units|average_exec' "$corpus/$target.log"
done

suites='unit_tests limits_without_assertions_tests end_to_end_tests robustness_tests'
cmake --preset release
# shellcheck disable=SC2086 # one word each
cmake --build --preset release --target $suites property_tests
EDID_COMPOSER_PROPERTY_RUNS=20000 build/release/bin/property_tests --gtest_brief=1
EDID_COMPOSER_LONG_LOOPS=1 build/release/bin/unit_tests --gtest_brief=1
for suite in $suites; do
  valgrind --quiet --error-exitcode=1 --leak-check=full --errors-for-leak-kinds=definite,indirect \
    build/release/bin/"$suite" --gtest_brief=1 --gtest_filter='-*DeathTest*'
done
echo 'Soaked without a finding.'

#!/bin/sh
# Builds everything and runs the tests that every change has to pass: optimised, and the same tests on the library and the
# program as AddressSanitizer, UndefinedBehaviorSanitizer and, for several threads, ThreadSanitizer see them.
# What is run before a release besides: scripts/test_all.sh.
# usage: scripts/test.sh [--no-install]
# Needs a Debian 12 machine, and root or sudo if one of the packages below is missing.
# With CI=true in the environment, compiler warnings are errors.
set -eu
cd "$(dirname "$0")/.."
. scripts/install_packages.sh
. scripts/run_tests.sh

echo 'Building the library, the program and their tests, and running them.'
install_packages build-essential cmake ninja-build git python3 libgtest-dev libgmock-dev libtomlplusplus-dev libcli11-dev \
  nlohmann-json3-dev libutfcpp-dev edid-decode v4l-utils shellcheck

warnings_are_errors=OFF
if [ "${CI:-}" = true ]; then
  warnings_are_errors=ON
fi
cmake --preset test -DEDID_COMPOSER_WERROR="$warnings_are_errors"
cmake --build --preset test
run_tests test build/test
echo 'All tests passed.'

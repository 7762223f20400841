#!/bin/sh
# Builds everything and runs every test: optimised, with AddressSanitizer and UndefinedBehaviorSanitizer, and, where several
# threads are at work, with ThreadSanitizer.
# Needs a Debian 12 machine, and root or sudo if one of the packages below is missing.
# With CI=true in the environment, compiler warnings are errors.
set -eu
cd "$(dirname "$0")/.."
. scripts/install_packages.sh

echo 'Building everything twice (optimised, with sanitizers) and running all tests; takes 5 to 15 minutes.'
install_packages build-essential cmake ninja-build git libgtest-dev libgmock-dev libtomlplusplus-dev libcli11-dev \
  nlohmann-json3-dev libutfcpp-dev edid-decode python3 doxygen groff-base man-db pkg-config fakeroot file valgrind chromium chromium-driver

warnings_are_errors=OFF
if [ "${CI:-}" = true ]; then
  warnings_are_errors=ON
fi

# tsan builds the tests with several threads only.
for preset in release asan tsan; do
  cmake --preset "$preset" -DBUILD_TESTING=ON -DEDID_COMPOSER_WERROR="$warnings_are_errors"
  cmake --build --preset "$preset"
  ctest --preset "$preset" -j "$(nproc)"
done
echo 'All tests passed.'

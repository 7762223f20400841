#!/bin/sh
# What is tested before a release, besides scripts/test.sh, which runs first: the documentation, what is installed and
# packaged, the page in a browser, what operations cost; everything with clang, and with sanitizers in the tests' own code
# as well; format, clang-tidy and coverage.
# usage: scripts/test_all.sh [--no-install | --ci]
# --ci: what fits the time of continuous integration: without clang, the sanitized tests' own code, clang-tidy and coverage.
# Needs a Debian 12 machine, and root or sudo if one of the packages below is missing.
set -eu
cd "$(dirname "$0")/.."
. scripts/install_packages.sh
. scripts/run_tests.sh

install_packages doxygen groff-base man-db pkg-config fakeroot file lintian valgrind chromium chromium-driver clang-format
scripts/test.sh $no_install
run_tests release_only build/test
git ls-files '*.h' '*.hpp' '*.c' '*.cpp' | xargs clang-format --dry-run --Werror
if [ "${1:-}" = --ci ]; then
  exit 0
fi

install_packages clang clang-tidy libclang-rt-14-dev gcovr
for preset in asan clang; do
  cmake --preset "$preset" -DEDID_COMPOSER_WERROR=ON
  cmake --build --preset "$preset"
  run_tests "$preset" "build/$preset"
done
git ls-files 'src/*.cpp' 'host/*.cpp' | xargs -n 8 -P "$(nproc)" clang-tidy -p build/clang --quiet --warnings-as-errors='*'
scripts/coverage.sh $no_install
echo 'All tests of a release passed.'

# shellcheck shell=sh
# Sourced by the scripts beside it: runs tests, none of which may be skipped.

# run_tests TEST_PRESET BUILD_FOLDER
run_tests() {
  ctest --preset "$1" -j "$(nproc)" --no-tests=error
  if grep -nE '^Test Skipped|^skipped: |skipped=[1-9]|  SKIPPED ' "$2"/Testing/Temporary/LastTest.log; then
    echo "Tests were skipped: see $2/Testing/Temporary/LastTest.log" >&2
    return 1
  fi
}

#!/bin/sh
# Measures what the tests cover and fails below 98 % of the lines or 95 % of the branches of src/, or 90 % of the lines of
# host/. What cannot be covered is marked in the source, with the reason (GCOVR_EXCL_...). Details: build/coverage/*.html
# usage: scripts/coverage.sh [--no-install]
set -eu
cd "$(dirname "$0")/.."
. scripts/install_packages.sh
. scripts/run_tests.sh

echo 'Building with coverage counters and running the tests.'
install_packages build-essential cmake ninja-build python3 libgtest-dev libgmock-dev libtomlplusplus-dev libcli11-dev \
  nlohmann-json3-dev libutfcpp-dev gcovr

cmake --preset coverage
cmake --build --preset coverage
find build/coverage -name '*.gcda' -delete
# Counters that a test's limit on file sizes keeps from being written are not to end up among what it compares.
GCOV_ERROR_FILE=/dev/null run_tests coverage build/coverage
gcovr --root . --filter src/ --filter host/ --exclude-unreachable-branches --exclude-throw-branches \
  --html-details build/coverage/index.html --json build/coverage/report.json build/coverage

# covered FOLDER OPTION...: prints the summary of a folder and fails below the options' limits.
covered() {
  folder=$1
  shift
  echo "$folder/"
  gcovr --root . --add-tracefile build/coverage/report.json --filter "$folder/" --print-summary \
    --output build/coverage/"$folder".txt "$@"
}
covered src --fail-under-line 98 --fail-under-branch 95
covered host --fail-under-line 90

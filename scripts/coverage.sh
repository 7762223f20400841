#!/bin/sh
# Measures what the tests cover of src/ and fails below 98 % of lines or 95 % of branches, or when docs/testing.md doesn't
# name just the branches that no test takes. Details: build/coverage/*.html
set -eu
cd "$(dirname "$0")/.."
. scripts/install_packages.sh

echo 'Building with coverage counters and running the tests; takes 3 to 8 minutes.'
install_packages build-essential cmake ninja-build libgtest-dev libgmock-dev gcovr python3

suites='unit_tests limits_without_assertions_tests end_to_end_tests robustness_tests property_tests'
cmake --preset coverage
# shellcheck disable=SC2086 # one word each
cmake --build --preset coverage --target $suites
find build/coverage -name '*.gcda' -delete
for suite in $suites; do
  "build/coverage/bin/$suite" --gtest_brief=1 >build/coverage/"$suite".log || {
    cat build/coverage/"$suite".log >&2
    exit 1
  }
done
gcovr --root . --filter 'src/' --exclude-unreachable-branches --exclude-throw-branches \
  --html-details build/coverage/index.html --txt build/coverage/branches.txt --branches --json build/coverage/report.json \
  build/coverage
gcovr --root . --add-tracefile build/coverage/report.json --print-summary --fail-under-line 98 --fail-under-branch 95 \
  --output build/coverage/lines.txt
python3 tests/coverage/check_reasons.py build/coverage/report.json .

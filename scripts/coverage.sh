#!/bin/sh
# Measures what the tests cover of src/ and fails below 98 % of lines or 95 % of branches. Details: build/coverage/*.html
set -eu
cd "$(dirname "$0")/.."
. scripts/install_packages.sh

echo 'Building with coverage counters and running the tests; takes 3 to 8 minutes.'
install_packages build-essential cmake ninja-build libgtest-dev libgmock-dev gcovr

cmake --preset coverage
cmake --build --preset coverage
find build/coverage -name '*.gcda' -delete
for suite in unit_tests end_to_end_tests robustness_tests property_tests; do
  if [ -x "build/coverage/bin/$suite" ]; then
    "build/coverage/bin/$suite" --gtest_brief=1 >build/coverage/"$suite".log || {
      cat build/coverage/"$suite".log >&2
      exit 1
    }
  fi
done
gcovr --root . --filter 'src/' --exclude-unreachable-branches --exclude-throw-branches \
  --html-details build/coverage/index.html --txt build/coverage/summary.txt --branches \
  --fail-under-line 98 build/coverage
gcovr --root . --filter 'src/' --exclude-unreachable-branches --exclude-throw-branches --print-summary \
  --fail-under-line 98 --fail-under-branch 95 --output build/coverage/lines.txt build/coverage

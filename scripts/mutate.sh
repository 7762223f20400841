#!/bin/sh
# Breaks the library on purpose, one change at a time, and shows that the tests notice each of them.
# Arguments go on to tests/mutation/mutate.py (--help tells them).
set -eu
cd "$(dirname "$0")/.."
. scripts/install_packages.sh

echo 'Breaking the library in 66 ways, building and testing each; takes 15 to 40 minutes.'
install_packages build-essential cmake ninja-build libgtest-dev libgmock-dev python3
exec python3 tests/mutation/mutate.py "$@"

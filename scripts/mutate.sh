#!/bin/sh
# Breaks the library and the program on purpose, one change at a time, and shows that the tests notice each of them.
# usage: scripts/mutate.sh [--no-install] [ARGUMENT OF tests/mutation/mutate.py...] (--help lists them)
set -eu
cd "$(dirname "$0")/.."
. scripts/install_packages.sh

echo 'Breaking the library and the program in every way of tests/mutation/mutations.toml, building and testing each.'
install_packages build-essential cmake ninja-build python3 libgtest-dev libgmock-dev libtomlplusplus-dev libcli11-dev \
  nlohmann-json3-dev libutfcpp-dev
exec python3 tests/mutation/mutate.py "$@"

#!/bin/sh
# Composes every golden case again and writes tests/end_to_end/golden. Review the changes like code:
# git diff tests/end_to_end/golden
# usage: scripts/update_goldens.sh [--no-install]
# Needs a Debian 12 machine, and root or sudo if one of the packages below is missing.
set -eu
cd "$(dirname "$0")/.."
. scripts/install_packages.sh

echo 'Building the library and the golden maker, and writing the goldens.'
install_packages build-essential cmake ninja-build python3 libgtest-dev libgmock-dev libtomlplusplus-dev libcli11-dev \
  nlohmann-json3-dev libutfcpp-dev

build() {
  cmake --preset release -DBUILD_TESTING=ON && cmake --build --preset release --target golden_maker
}
mkdir -p build
if ! build >build/goldens.log 2>&1; then
  cat build/goldens.log >&2
  exit 1
fi
build/release/bin/golden_maker

#!/bin/sh
# Builds the page that composes and explains in a browser: one file, build/web/edid-composer.html.
# usage: scripts/web.sh [--no-install]
# Needs a Debian 12 machine, 840 MB for Emscripten, and root or sudo if one of the packages below is missing.
set -eu
cd "$(dirname "$0")/.."
. scripts/install_packages.sh

echo 'Building build/web/edid-composer.html.'
install_packages emscripten cmake ninja-build python3 libtomlplusplus-dev libcli11-dev nlohmann-json3-dev libutfcpp-dev
cmake --preset web
cmake --build --preset web

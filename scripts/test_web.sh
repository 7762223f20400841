#!/bin/sh
# Builds the page and the program, and tests in Chromium that the page computes what the program does, can be used by
# mouse, keyboard and screen reader, composes in time, and stands whatever it is given.
# usage: scripts/test_web.sh [--no-install]
# Writes pictures of the page into build/web/pictures: light, dark, phone and paper.
# Needs a Debian 12 machine, 840 MB for Emscripten, and root or sudo if one of the packages below is missing.
set -eu
cd "$(dirname "$0")/.."
. scripts/install_packages.sh

scripts/web.sh $no_install
install_packages build-essential chromium chromium-driver
cmake --preset release -DBUILD_TESTING=OFF
cmake --build --preset release --target edid_composer_cli

SOURCE_DIR=$PWD
PAGE=$PWD/build/web/edid-composer.html
EDID_COMPOSER=$PWD/build/release/bin/edid-composer
export SOURCE_DIR PAGE EDID_COMPOSER
for test in same_as_program page hostile; do
  python3 -B "tests/web/${test}_test.py"
done
python3 -B tests/web/pictures.py build/web/pictures
echo 'All tests of the page passed.'

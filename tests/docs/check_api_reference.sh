#!/bin/sh
# Makes the API reference and fails on a warning.
# Usage: check_api_reference.sh SOURCE OUTPUT
set -eu
cd "$1"
if ! command -v doxygen >/dev/null; then
  echo 'skipped: doxygen is not installed'
  exit 77
fi
mkdir -p "$2"
{ cat docs/Doxyfile && echo "OUTPUT_DIRECTORY = $2"; } | doxygen -
test -s "$2/html/index.html"
echo 'the API reference is made without a warning'

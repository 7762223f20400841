#!/bin/bash
# The version text can be found in the library file by its marker.
# Usage: version_text.sh LIBRARY
. "$(dirname "$0")/reporting.sh"
found=$(grep -a -o '#@# libedid_composer\.so Unofficial Build [ -~]*' "$1") || fail "no version text in $1"
[ "$(echo "$found" | wc -l)" -eq 1 ] || fail "more than one version text:
$found"
echo "$found" | grep -Eq 'Build [A-Z][a-z]{2} [A-Z][a-z]{2} [ 123][0-9] [0-9:]{8} [^ ]+ [0-9]{4}$' || fail "no date: $found"
echo "$found"

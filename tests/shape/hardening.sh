#!/bin/bash
# Relocations are read-only once the library is loaded, all of them are made at once, and no data can be executed.
# Usage: hardening.sh LIBRARY
. "$(dirname "$0")/reporting.sh"
library=$1

segments=$(readelf -lW "$library") || fail "readelf cannot read $library"
dynamic=$(readelf -dW "$library")
echo "$segments" | grep -q ' GNU_RELRO ' || fail "no GNU_RELRO segment"
echo "$dynamic" | grep -Eq '\((FLAGS|FLAGS_1)\).*NOW' || fail "functions are bound lazily"
echo "$dynamic" | grep -q '(TEXTREL)' && fail "code is relocated"
stack=$(echo "$segments" | awk '$1 == "GNU_STACK" {print $7}')
[ "$stack" = RW ] || fail "the stack's flags are '$stack', not 'RW'"
echo "$segments" | awk '$1 == "LOAD" && /RWE/ {found = 1} END {exit found}' || fail "a segment is writable and executable"
echo "read-only relocations, bound at load; nothing both writable and executable"

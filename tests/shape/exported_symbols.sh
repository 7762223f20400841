#!/bin/bash
# The library exports exactly the operations and objects of its list.
# Usage: exported_symbols.sh LIBRARY LIST
. "$(dirname "$0")/reporting.sh"
library=$1
list=$2

# AddressSanitizer marks each exported object with a symbol of its own.
exported=$(nm -D --defined-only "$library" | awk '{print $NF}' | grep -v '^__odr_asan' | sort) || fail "nm cannot read $library"
difference=$(diff <(sort "$list") <(echo "$exported")) || fail "exported symbols ('<' is missing, '>' is too many):
$difference"
echo "$(wc -l <"$list") symbols exported, as listed"

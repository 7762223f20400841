#!/bin/bash
# The library leaves to its process the eight config_* operations, to the C library what the page about building says, and
# nothing else.
# Usage: undefined_symbols.sh LIBRARY PAGE
. "$(dirname "$0")/reporting.sh"
library=$1
page=$2

undefined=$(nm -D --undefined-only "$library") || fail "nm cannot read $library"
host=$(echo "$undefined" | awk '$1 == "U" && $2 !~ /@/ {print $2}' | sort)
expected="config_get_int
config_get_str
config_node_find
config_node_first_child
config_node_get_int
config_node_get_name
config_node_get_str
config_node_next_sibling"
difference=$(diff <(echo "$expected") <(echo "$host")) || fail "operations left to the host ('<' is missing, '>' is too many):
$difference"

# What compilers put into every shared library, weakly.
foreign=$(echo "$undefined" | awk '$1 != "U" {print $2} $1 == "U" && /@/ {print $2}' |
  grep -Ev '@GLIBC_|^(__gmon_start__|_ITM_deregisterTMCloneTable|_ITM_registerTMCloneTable)$')
[ -z "$foreign" ] || fail "symbols that are neither the host's nor the C library's:
$foreign"

named=$(sed -n '/^## What it needs of the C library/,/^## /p' "$page" | grep -o '`[a-z_]*`' | tr -d '`' | sort -u)
[ "$(echo "$named" | wc -l)" -ge 15 ] || fail "$page names no functions of the C library"
used=$(echo "$undefined" | sed -n 's/.* U \(.*\)@GLIBC_.*/\1/p' | sed 's/^__\([a-z]*\)_chk$/\1/' | sort -u)
more=$(comm -13 <(echo "$named") <(echo "$used") | grep -Evx '__cxa_finalize|__stack_chk_guard')
[ -z "$more" ] || fail "$page does not name what the library needs of the C library:
$more"
echo "$(echo "$host" | wc -l) operations left to the host, $(echo "$undefined" | grep -c '@GLIBC_') symbols of the C library"

#!/bin/bash
# Loading the library runs no code of its own: .init_array and .fini_array hold the compiler's one function each.
# Usage: static_initialisers.sh LIBRARY
. "$(dirname "$0")/reporting.sh"
library=$1

sections=$(readelf -SW "$library" | sed 's/^ *\[ *[0-9]*\] *//') || fail "readelf cannot read $library"
# Prints address and size of a section, in hexadecimal.
section() { echo "$sections" | awk -v name="$1" '$1 == name {print $3, $5}'; }

for absent in .ctors .dtors .preinit_array; do
  [ -z "$(section $absent)" ] || fail "there is a section $absent"
done

pointer_size=$(readelf -hW "$library" | grep -q ELF64 && echo 8 || echo 4)
check_array() {
  local name=$1 function=$2 address size target
  read -r address size <<<"$(section "$name")"
  [ -n "${size:-}" ] || { echo "no $name"; return; }
  [ $((16#$size)) -eq "$pointer_size" ] || fail "$name holds $((16#$size / pointer_size)) functions, not 1"
  target=$(readelf -rW "$library" | awk -v at="$address" '$1 == at {print $NF}')
  nm "$library" | awk -v at="$target" '{sub(/^0+/, "", $1)} $1 == at {print $3}' | grep -qx "$function" ||
    fail "$name points at $target, which is not $function"
  echo "$name holds $function only"
}
check_array .init_array frame_dummy
check_array .fini_array __do_global_dtors_aux

initialisers=$(nm "$library" | awk '{print $NF}' | grep -E '^(_GLOBAL__(sub_)?[ID]_|__cxx_global_var_init)')
[ -z "$initialisers" ] || fail "initialisers of static objects:
$initialisers"

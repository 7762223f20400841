#!/bin/bash
# The library has a SONAME and needs the C library only: no C++ run-time library, no libgcc_s.
# Usage: needed_libraries.sh LIBRARY SONAME
. "$(dirname "$0")/reporting.sh"
library=$1
soname=$2

dynamic=$(readelf -dW "$library") || fail "readelf cannot read $library"
actual_soname=$(echo "$dynamic" | sed -n 's/.*(SONAME).*\[\(.*\)\]/\1/p')
[ "$actual_soname" = "$soname" ] || fail "the SONAME is '$actual_soname', not '$soname'"

# The C library's dynamic loader stands beside it where the linker resolves a thread-local variable through it.
needed=$(echo "$dynamic" | sed -n 's/.*(NEEDED).*\[\(.*\)\]/\1/p' | grep -Ev '^ld-linux.*\.so\.[0-9]+$')
[ "$needed" = libc.so.6 ] || fail "needed libraries are not just libc.so.6:
$needed"
echo "$soname needs $needed"

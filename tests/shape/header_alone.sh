#!/bin/bash
# The public header compiles alone, and twice, in every language that it is for.
# Usage: header_alone.sh C_COMPILER CXX_COMPILER INCLUDE_DIRECTORY
. "$(dirname "$0")/reporting.sh"
include=$3

compile() {
  local compiler=$1 language=$2 standard=$3
  printf '#include "edid_composer.h"\n#include "edid_composer.h"\n' |
    "$compiler" -x "$language" -std="$standard" -Wall -Wextra -Wpedantic -Werror -fsyntax-only -I "$include" - ||
    fail "the header does not compile as $standard"
}
for standard in c11 c17; do compile "$1" c $standard; done
for standard in c++17 c++20; do compile "$2" c++ $standard; done
echo "compiles as C11, C17, C++17 and C++20"

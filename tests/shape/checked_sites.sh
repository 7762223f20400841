#!/bin/bash
# An operation that diagnostics are to name must exist.
# Usage: checked_sites.sh CXX_COMPILER PROJECT
. "$(dirname "$0")/reporting.sh"

compiles() {
  printf '#include "diagnostics.h"\nREPORTS_AS(%s);\nvoid f() { LOG_ERROR("text"); }\n' "$2" |
    "$1" -x c++ -std=c++20 -fsyntax-only -DEDID_COMPOSER_MODULE='"utility"' -I "$project/src" -I "$project/include" - 2>&1
}
project=$2
message=$(compiles "$1" compose_edid) || fail "an operation's name does not compile:
$message"
message=$(compiles "$1" compose_edidd) && fail "a name that is no operation's compiles"
case $message in
  *compose_edidd*) echo "a name that is no operation's does not compile" ;;
  *) fail "a name that is no operation's fails for another reason:
$message" ;;
esac

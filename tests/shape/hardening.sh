#!/bin/bash
# What is installed is hardened: relocations are read-only once it is loaded, all of them are made at once, no data can be
# executed, functions with buffers look at a guard, and calls that can overflow a buffer are checked, as are jumps where the
# processor can do that, and indexes into the containers of the C++ run-time library, which the library does without.
# Usage: [JUMP_PROTECTION=COMPILER_FLAG] hardening.sh {library|store|program FILE}...
. "$(dirname "$0")/reporting.sh"

# The instruction that marks where an indirect jump may go.
case ${JUMP_PROTECTION:-} in
  '') landing='' ;;
  -fcf-protection) landing='\<endbr(32|64)\>' ;;
  -mbranch-protection=standard) landing='\<(paciasp|bti)\>' ;;
  *) fail "how is it seen that $JUMP_PROTECTION has had an effect?" ;;
esac

check() {
  local kind=$1 file=$2 segments dynamic stack called marks
  segments=$(readelf -lW "$file") || fail "readelf cannot read $file"
  dynamic=$(readelf -dW "$file")
  echo "$segments" | grep -q ' GNU_RELRO ' || fail "$kind: no GNU_RELRO segment"
  echo "$dynamic" | grep -Eq '\((FLAGS|FLAGS_1)\).*NOW' || fail "$kind: functions are bound lazily"
  echo "$dynamic" | grep -q '(TEXTREL)' && fail "$kind: code is relocated"
  stack=$(echo "$segments" | awk '$1 == "GNU_STACK" {print $7}')
  [ "$stack" = RW ] || fail "$kind: the stack's flags are '$stack', not 'RW'"
  echo "$segments" | awk '$1 == "LOAD" && /RWE/ {found = 1} END {exit found}' ||
    fail "$kind: a segment is writable and executable"
  readelf -hW "$file" | grep -q 'Type: *DYN' || fail "$kind: it has a fixed place in memory"

  called=$(readelf --dyn-syms -W "$file" | awk '$7 == "UND" {sub(/@.*/, "", $8); print $8}')
  echo "$called" | grep -Eqx '__stack_chk_(fail|guard)' || fail "$kind: no function looks at a guard on the stack"
  echo "$called" | grep -Eqx "__[a-z]+_chk" || fail "$kind: no call of the C library is checked"
  [ "$kind" = library ] || echo "$called" | grep -qx '_ZSt21__glibcxx_assert_failPKciS0_S0_' ||
    fail "$kind: no index into a container is checked"

  [ -n "$landing" ] || return
  marks=$("${OBJDUMP:-objdump}" -d --no-show-raw-insn "$file" | grep -Ec "$landing")
  [ "$marks" -ge 50 ] || fail "$kind: only $marks places are marked as targets of jumps"
}

while [ $# -ge 2 ]; do
  check "$1" "$2"
  echo "$1: read-only relocations, bound at load; checked stack, calls${landing:+, jumps}; no writable code"
  shift 2
done

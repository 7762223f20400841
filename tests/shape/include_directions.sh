#!/bin/bash
# Modules include downward only, the program's rooms likewise, no two files include each other, and internal headers stay inside the library and the
# tests of its private functions: tests through the public operations and what tests share see the public header only.
# Usage: include_directions.sh PROJECT
. "$(dirname "$0")/reporting.sh"
cd "$1" || fail "no such directory: $1"
violations=""
edges=""
count=0

# How far up a file of src/ stands, by its path within src/.
rank() {
  case $1 in
    edid_composer/*) echo 4 ;;
    edid_decode_encode/*) echo 3 ;;
    utility/*) echo 2 ;;
    linked_list/*) echo 1 ;;
    version/*) echo 0 ;;
    */*) echo unknown ;;
    *) echo 0 ;; # What every module uses stands at the top of src/.
  esac
}

# Prints the quoted includes of a file.
includes() { sed -nE 's/^[[:space:]]*#[[:space:]]*include[[:space:]]+"([^"]+)".*/\1/p' "$1"; }

complain() { violations+="$1"$'\n'; }

while read -r file; do
  own=${file#src/}
  own_rank=$(rank "$own")
  [ "$own_rank" != unknown ] || complain "$file is in no known module"
  for included in $(includes "$file"); do
    count=$((count + 1))
    [ "$included" = edid_composer.h ] && continue
    if [ ! -f "src/$included" ]; then
      complain "$file includes $included, which is not in src/ by that path"
      continue
    fi
    edges+="$own $included"$'\n'
    [ "$(rank "$included")" -le "$own_rank" ] || complain "$file includes $included, which stands above it"
  done
done < <(find src -name '*.h' -o -name '*.cpp' -o -name '*.cpp.in' | sort)
[ "$count" -gt 0 ] || fail "no includes found in src/"

# How far up a room of the program stands: in the order of the table in host/cli/CMakeLists.txt.
room_rank() {
  local place=0 room
  for room in io text edid_input edid_text composition platform batch explain commands; do
    [ "${1%%/*}" != "$room" ] || { echo "$place" && return; }
    place=$((place + 1))
  done
  if [ "$1" = main.cpp ]; then echo "$place"; else echo unknown; fi
}

program_count=0
while read -r file; do
  own=${file#host/cli/}
  own_rank=$(room_rank "$own")
  [ "$own_rank" != unknown ] || complain "$file is in no known room"
  for included in $(includes "$file"); do
    [ -f "host/cli/$included" ] || continue
    program_count=$((program_count + 1))
    edges+="cli/$own cli/$included"$'\n'
    [ "$(room_rank "$included")" -le "$own_rank" ] || complain "$file includes $included, which stands above it"
  done
done < <(find host/cli -name '*.h' -o -name '*.cpp' | sort)
[ "$program_count" -gt 0 ] || fail "no includes found in host/cli/"

cycles=$(printf '%s' "$edges" | tsort 2>&1 >/dev/null) || complain "files that include each other:"$'\n'"$cycles"

# Outside of src/: an include is internal when it names a file of src/ and none beside the including file or at the roots
# of the including directory.
internal() {
  local file=$1 included=$2
  case $included in */src/*) return 0 ;; esac
  [ -f "src/$included" ] || return 1
  [ ! -f "$(dirname "$file")/$included" ] && [ ! -f "tests/$included" ] && [ ! -f "host/$included" ]
}

while read -r file; do
  case $file in
    tests/support/* | tests/end_to_end/* | tests/golden/* | tests/host/* | tests/shape/*) ;;
    tests/* | bench/*) continue ;;
  esac
  for included in $(includes "$file"); do
    ! internal "$file" "$included" || complain "$file includes the internal header $included"
  done
done < <(find . -path ./src -prune -o -path ./build -prune -o -path ./.git -prune -o \( -name '*.h' -o -name '*.c' -o -name '*.cpp' -o -name '*.hpp' \) -print | sed 's#^\./##' | sort)

[ -z "$violations" ] || fail "include directions:
$violations"
echo "$count includes in src/ and $program_count in host/cli/, all downward"

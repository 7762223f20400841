#!/bin/bash
# Modules include downward only, the rooms of the composer and of the program likewise, no two files include each other,
# and internal headers stay inside the library and the tests of its private functions: tests through the public
# operations and what tests share see the public header only. A file of src/ has a header of its own, or holds public
# operations.
# Usage: include_directions.sh PROJECT
. "$(dirname "$0")/reporting.sh"
cd "$1" || fail "no such directory: $1"
violations=""
edges=""
count=0
arrows=0

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

# The rooms that a room of the composer may include besides itself; compose, above them, all.
allowed_rooms() {
  case $1 in
    inputs | platform | codec) ;;
    selection) echo inputs ;;
    new_edid) echo inputs selection ;;
    explain) echo inputs selection new_edid ;;
    hdmi2) echo inputs platform selection new_edid explain codec ;;
    compose) echo inputs platform selection new_edid explain hdmi2 codec ;;
    *) return 1 ;;
  esac
}

# The room of a file of edid_composer/. What every room works from stands beside those that compose.
composer_room() {
  case $1 in
    edid_composer/*/*) basename "$(dirname "$1")" ;;
    edid_composer/inputs.* | edid_composer/journal.*) echo inputs ;;
    *) echo compose ;;
  esac
}

# Prints the quoted includes of a file.
includes() { sed -nE 's/^[[:space:]]*#[[:space:]]*include[[:space:]]+"([^"]+)".*/\1/p' "$1"; }

# Whether a file defines something that the library exports.
operations=$(paste -sd'|' tests/shape/exported_symbols.txt)
holds_operations() { grep -qE "^[a-z].*\\b($operations)(\\(|\\[)" "$1"; }

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
    case "$own $included" in edid_composer/*' edid_composer/'*) ;; *) continue ;; esac
    room=$(composer_room "$own")
    included_room=$(composer_room "$included")
    rooms=$(allowed_rooms "$room") || complain "$file is in no known room"
    case " $room $rooms " in
      *" $included_room "*) arrows=$((arrows + 1)) ;;
      *) complain "$file includes $included, which is not for $room" ;;
    esac
  done
  case $file in
    *.cpp) [ -f "${file%.cpp}.h" ] || holds_operations "$file" ||
      complain "$file has neither a header of its own nor public operations" ;;
  esac
done < <(find src -name '*.h' -o -name '*.cpp' -o -name '*.cpp.in' | sort)
[ "$count" -gt 0 ] || fail "no includes found in src/"
[ "$arrows" -gt 0 ] || fail "no includes found in src/edid_composer/"

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

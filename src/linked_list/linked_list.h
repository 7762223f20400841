// Lists and entries whose tag is known.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

class entry_arena_t;

/// The tag of a type name: its bytes, sign-extended, XORed together at shifts of 0, 8, 16, 24, 0, ...
constexpr u32 _calculate_str_checksum(const char *name) {
  u32 tag = 0;
  u32 shift = 0;
  for (; *name != '\0'; ++name) {
    const auto extended = static_cast<u32>(i32{static_cast<signed char>(*name)});
    tag ^= extended << shift;
    shift = (shift + 8) % 32;
  }
  return tag;
}

/// ll_init, in whose name it reports, for a tag that is known.
bool init_list(ll_list_t *list, u32 tag);

/// ll_create_entry, in whose name it reports, for a payload that the caller fills; from the heap without an @p arena.
/// Null when there is no memory for it.
ll_entry_t *create_unfilled_entry(u32 size, u32 tag, entry_arena_t *arena);

/// Frees an entry that no list holds, unless it belongs to an arena.
void discard_entry(ll_entry_t *entry, const entry_arena_t *arena);

/// ll_copy_list, in whose name it reports; the copies come from the heap without an @p arena.
bool copy_list(const ll_list_t *src_list, ll_list_t *dst_list, u32 size, entry_arena_t *arena);

}  // namespace edid_composer

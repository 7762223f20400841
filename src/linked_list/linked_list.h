// What the list derives its checks from, and the making of entries whose tag is known.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

/// The magic of an initialised head: its own address, so that a moved or copied head is found out. 0 for a null list.
u32 _get_magic_number(const ll_list_t *list);

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

/// ll_create_entry, in whose name it reports, for a payload that the caller fills. Null when there is no memory for it;
/// the two outputs are then named in the report.
ll_entry_t *create_unfilled_entry(u32 size, u32 tag, const void *entry_output, const void *data_output);

}  // namespace edid_composer

// What the list derives its checks from.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

/// The magic of an initialised head: its own address, so that a moved or copied head is found out. 0 for a null list.
u32 _get_magic_number(const ll_list_t *list);

/// The tag of a type name: its bytes, sign-extended, XORed together at shifts of 0, 8, 16, 24, 0, ...
u32 _calculate_str_checksum(const char *name);

}  // namespace edid_composer

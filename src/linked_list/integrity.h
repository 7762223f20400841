// Whether a list is one, and is sound.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

/// The magic of an initialised head: its own address, so that a moved or copied head is found out. 0 for a null list.
u32 _get_magic_number(const ll_list_t *list);

/// ll_verify_integrity, in whose name it reports.
bool verify_integrity(const ll_list_t *list);

}  // namespace edid_composer

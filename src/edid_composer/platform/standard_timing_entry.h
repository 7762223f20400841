// An entry of the list of standard timings: width, height, refresh rate and, where there is one, its fraction, as in
// "1920 1080 60" or "1280x1024x59.94".
#pragma once

#include "edid_composer/platform/configuration_list.h"
#include "linked_list/entry_arena.h"
#include "utility/configuration.h"

namespace edid_composer {

/// Appends the standard timing of an entry; one that is none is reported.
configuration_outcome_t _get_std_timing_callback(const configuration_entry_t &entry, ll_list_t *timings,
                                                 entry_arena_t *arena);

}  // namespace edid_composer

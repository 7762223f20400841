// What the new EDID makes of the selected modes: enough short video descriptors, and the detailed timings.
#pragma once

#include "linked_list/entry_arena.h"

namespace edid_composer {

/// The fewest modes that an EDID has.
inline constexpr i32 fewest_modes = 4;
inline constexpr u32 padding_vic = 1;

/// Appends VIC 1 until there are enough modes. False when an entry could not be had.
bool pad_video_modes(ll_list_t *modes, entry_arena_t *arena);

/// Appends the timings of the first two modes; the first is the preferred timing. False when a mode has none.
bool add_detailed_timings(const ll_list_t &modes, ll_list_t *timings, entry_arena_t *arena);

void trace_video_modes(const ll_list_t *video_list);

}  // namespace edid_composer

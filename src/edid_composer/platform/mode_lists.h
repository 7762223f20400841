// The lists of the platform configuration.
#pragma once

#include "linked_list/entry_arena.h"

namespace edid_composer {

/// The lists of video modes, by the numbers that stand in reports.
enum platform_list_type : u32 {
  list_50_priority = 0,
  list_60_priority = 1,
  list_50_additional = 2,
  list_60_additional = 3,
};

/// Appends the modes of a list of the configuration; an empty one is reported.
void _get_platform_list(platform_list_type type, ll_list_t *list, entry_arena_t *arena);
/// Reads up to 7 HDMI_VICs.
void _get_4k_x_2k_modes(const char *list_name, i32 (&modes)[7]);
/// Sets the bits of the timings that a list names.
void _get_est_timing_list(const char *list_name, u32 *mask);
void _get_std_timing_list(ll_list_t *list, entry_arena_t *arena);

}  // namespace edid_composer

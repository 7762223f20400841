// Selection of the video modes that the new EDID offers.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

class decisions_t;

/// Appends to @p ret_modes what the platform's priority list names and the sink or the addition list has.
u32 _filter_video_modes(const edid_t *edid, const compose_cfg_t *cfg, ll_list_t *ret_modes,
                        const platform_values_t *platform_values, decisions_t *decisions = nullptr);

/// Appends a copy (VIC and 3D mask) of each entry of @p extra_list to @p vic_list.
u32 _combine_lists(ll_list_t *vic_list, const ll_list_t *extra_list);

/// The sink's refresh family, 50 or 60: that of its first mode that tells, else the platform's.
i32 _determine_tv_native_refresh_rate(const edid_t *edid, const platform_values_t *platform_values,
                                      decisions_t *decisions = nullptr);

/// Frame height of the tallest mode, in lines; 0 for an empty list.
u32 _find_largest_height(const ll_list_t *video_list);

/// Deletes the modes that are taller than @p limit lines.
void _remove_larger_height_modes(u32 limit, ll_list_t *list, decisions_t *decisions = nullptr);

/// Tells whether a mode is plausible; false for NULL.
u32 _valid_current_mode(const video_mode_t *mode);

}  // namespace edid_composer

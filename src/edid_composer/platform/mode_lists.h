// The lists of the platform configuration.
#pragma once

#include "edid_composer/platform/configuration_keys.h"
#include "edid_composer/platform/configuration_readings.h"
#include "linked_list/entry_arena.h"

namespace edid_composer {

/// Appends the modes of a list of the configuration; an empty one is reported.
void _get_platform_list(const platform_key_t &row, ll_list_t *list, entry_arena_t *arena,
                        const configuration_readings_t &readings);
/// Reads up to 7 HDMI_VICs.
void _get_4k_x_2k_modes(const configuration_key_t &key, i32 (&modes)[7], const configuration_readings_t &readings);
/// Sets the bits of the timings that a list names.
void _get_est_timing_list(const configuration_key_t &key, u32 *mask, const configuration_readings_t &readings);
void _get_std_timing_list(const configuration_key_t &key, ll_list_t *list, entry_arena_t *arena,
                          const configuration_readings_t &readings);

}  // namespace edid_composer

// YCbCr 4:2:0 in the new EDID: the modes that are offered in it only, and the map of those that are offered in it too.
#pragma once

#include "edid_composer/hdmi2/plan.h"

namespace edid_composer {

/// The most modes that the 4:2:0 video data block holds.
inline constexpr u32 most_420_only_modes = HDMI2_MOST_BLOCK_BYTES - 1;

void fill_420_video(const extended_modes_t &modes, hdmi2_t *blocks);

/// @p base_modes short video descriptors stand before those of the modes. Absent without a mode to mark.
void fill_420_map(const extended_modes_t &modes, u32 base_modes, hdmi2_t *blocks);

}  // namespace edid_composer

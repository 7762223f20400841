// What the new EDID is to hold: all that was chosen, less what was left out for room.
#pragma once

#include "edid_composer/hdmi2/extended_modes.h"
#include "edid_composer/new_edid/population.h"

namespace edid_composer {

/// Blocks of the sink that can be passed on.
enum passed_block_t : u32 { passed_hdr_dynamic, passed_hdr10plus, passed_dolby_vision, passed_freesync };
inline constexpr u32 passed_block_count = 4;

/// What was composed without HDMI 2.
struct base_offer_t {
  const edid_t &record;
  const population_t &population;
};

struct plan_t {
  u32 base_modes;             ///< How many modes up to VIC 64 are left, from the first on.
  bool structures_3d = true;  ///< Whether 3D structures beyond the mandatory ones are written.
  bool passed[passed_block_count] = {true, true, true, true};  ///< Whether there is room for them.
  extended_modes_t extended;
};

}  // namespace edid_composer

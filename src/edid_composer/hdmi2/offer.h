// All that a plan comes to: the data blocks of HDMI 2, what changes in the HDMI block, and the room it takes.
#pragma once

#include "edid_composer/hdmi2/forum_block.h"

namespace edid_composer {

struct offer_t {
  u32 rate;  ///< What the link to the box has to carry, MHz.
  deep_color_t depths;
  tmds_clock_t tmds_clock;
  depths_420_t depths_420;
  vrr_offer_t vrr;
  u32 data_block_end;  ///< Bytes of the extension up to the last data block.
  hdmi2_t blocks;
};

/// Fills @p offer with what follows from the plan. Prints nothing.
void make_offer(const layer_inputs_t &inputs, const base_offer_t &base, const link_rates_t &rates, const plan_t &plan,
                offer_t *offer);

/// Bytes of the 3D structures that the plan leaves in the HDMI block.
u32 planned_3d_bytes(const base_offer_t &base, const plan_t &plan);

/// The first mode above VIC 64 that a detailed timing can hold; null without one.
const extended_mode_t *first_detailed_mode(const extended_modes_t &modes);

}  // namespace edid_composer

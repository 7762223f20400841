// The sink's data blocks that the new EDID passes on as they stand.
#pragma once

#include "edid_composer/hdmi2/forum_block.h"

namespace edid_composer {

/// A block that can be passed on, and the platform's say about it.
struct passed_block_row_t {
  const char *name;
  hdmi2_block_t hdmi2_t::*block;
  i32 hdmi2_values_t::*key;
};
/// By passed_block_t.
inline constexpr passed_block_row_t passed_blocks[passed_block_count] = {
    {"HDR dynamic metadata block", &hdmi2_t::hdr_dynamic, &hdmi2_values_t::pass_hdr_dynamic},
    {"HDR10+ block", &hdmi2_t::hdr10plus, &hdmi2_values_t::pass_hdr10plus},
    {"Dolby Vision block", &hdmi2_t::dolby_vision, &hdmi2_values_t::pass_dolby_vision},
    {"FreeSync block", &hdmi2_t::freesync, &hdmi2_values_t::pass_freesync},
};

/// What 2160p60 takes, MHz.
inline constexpr u32 rate_of_2160p60 = 594;

/// Why a block is passed on (COMPOSE_REASON_PASSED_ON) or not, room aside. @p rate in MHz.
compose_reason judge_passed_block(const layer_inputs_t &inputs, passed_block_t which, u32 rate, const vrr_offer_t &vrr);

/// Copies the blocks that are passed on and have room.
void fill_passed_blocks(const layer_inputs_t &inputs, const plan_t &plan, u32 rate, const vrr_offer_t &vrr,
                        hdmi2_t *blocks);

}  // namespace edid_composer

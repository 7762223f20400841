#include "edid_composer/hdmi2/offer.h"

#include <algorithm>

#include "edid_composer/hdmi2/codec/hdmi2_blocks.h"
#include "edid_composer/hdmi2/hdmi_block.h"
#include "edid_composer/hdmi2/passed_blocks.h"
#include "edid_composer/hdmi2/picture_blocks.h"
#include "edid_composer/hdmi2/ycbcr_420_blocks.h"
#include "edid_decode_encode/hdmi_vendor_block_encoder.h"
#include "edid_decode_encode/short_audio.h"

namespace edid_composer {
namespace {

/// The data blocks that are written without HDMI 2, with the extension's header before them.
u32 end_of_other_blocks(const base_offer_t &base, const plan_t &plan) {
  constexpr u32 header = 1;
  constexpr u32 most_audio_formats = 10;
  const u32 audio_formats = std::clamp(base.record.audio_list.size, 1U, most_audio_formats);
  const u32 modes = plan.base_modes + plan.extended.count_in(mode_place_t::video_block);
  return cea_extension::data_blocks + header + data_block::speaker_length + header + modes + header +
         audio_formats * short_audio_size + header +
         hdmi_vendor_block_length(base.record, planned_3d_bytes(base, plan));
}

}  // namespace

void make_offer(const layer_inputs_t &inputs, const base_offer_t &base, const link_rates_t &rates, const plan_t &plan,
                offer_t *offer) {
  *offer = {};
  const u32 rate = rate_for_modes(plan.extended, rates);
  offer->rate = rate;
  offer->depths = depths_for_sink(inputs, base.population.deep_color);
  offer->tmds_clock = tmds_clock_with_extended(inputs, base, plan, rates, rate, offer->depths);
  offer->depths_420 = offer_depths_420(inputs, plan.extended, rate);
  offer->vrr = offer_vrr(inputs);
  hdmi2_t *const blocks = &offer->blocks;
  blocks->size = sizeof *blocks;
  fill_forum_block(inputs, rate, has_uhd_vic(base.record, plan.extended), offer->depths_420, offer->vrr, blocks);
  fill_video_capability(inputs, blocks);
  fill_colorimetry(inputs, base.record, blocks);
  fill_hdr_static(inputs, blocks);
  fill_420_video(plan.extended, blocks);
  fill_420_map(plan.extended, plan.base_modes, blocks);
  fill_passed_blocks(inputs, plan, rate, offer->vrr, blocks);
  offer->data_block_end = end_of_other_blocks(base, plan) + hdmi2_blocks_size(*blocks);
}

u32 planned_3d_bytes(const base_offer_t &base, const plan_t &plan) {
  return plan.structures_3d ? written_3d_bytes(base.record, plan.base_modes) : 0;
}

const extended_mode_t *first_detailed_mode(const extended_modes_t &modes) {
  const auto *const found = std::find_if(modes.begin(), modes.end(), [](const extended_mode_t &mode) {
    return mode.place == mode_place_t::video_block && fits_detailed_timing(*mode.timing);
  });
  return found == modes.end() ? nullptr : found;
}

}  // namespace edid_composer

#include "edid_composer/hdmi2/passed_blocks.h"

#include "edid_composer/hdmi2/codec/passed_on_blocks.h"

namespace edid_composer {

compose_reason judge_passed_block(const layer_inputs_t &inputs, passed_block_t which, u32 rate,
                                  const vrr_offer_t &vrr) {
  constexpr i32 as_sink = 2;
  const passed_block_row_t &row = passed_blocks[which];
  const hdmi2_block_t &block = inputs.sink.*row.block;
  if (block.length == 0) return COMPOSE_REASON_SINK_WITHOUT;
  if (inputs.platform.*row.key == 0) return COMPOSE_REASON_OFF;
  if (which == passed_dolby_vision && rate < rate_of_2160p60 && dolby_vision_has_2160p60(block)) {
    return COMPOSE_REASON_RATE_BELOW_BLOCK;
  }
  if (which == passed_freesync && (inputs.platform.vrr != as_sink || !is_vrr_of_sink(inputs, vrr))) {
    return COMPOSE_REASON_VRR_CHANGED;
  }
  return COMPOSE_REASON_PASSED_ON;
}

void fill_passed_blocks(const layer_inputs_t &inputs, const plan_t &plan, u32 rate, const vrr_offer_t &vrr,
                        hdmi2_t *blocks) {
  for (u32 i = 0; i < passed_block_count; ++i) {
    if (!plan.passed[i]) continue;
    const auto which = static_cast<passed_block_t>(i);
    if (judge_passed_block(inputs, which, rate, vrr) != COMPOSE_REASON_PASSED_ON) continue;
    blocks->*passed_blocks[i].block = inputs.sink.*passed_blocks[i].block;
  }
}

}  // namespace edid_composer

#include "edid_composer/hdmi2/room_explanation.h"

#include <algorithm>

#include "edid_composer/hdmi2/passed_blocks.h"

namespace edid_composer {
namespace {

/// By passed_block_t.
constexpr compose_room_item items[passed_block_count] = {COMPOSE_ROOM_HDR_DYNAMIC, COMPOSE_ROOM_HDR10PLUS,
                                                         COMPOSE_ROOM_DOLBY_VISION, COMPOSE_ROOM_FREESYNC};

reason_values_t values_of(compose_reason reason, const layer_inputs_t &inputs, passed_block_t which, u32 rate) {
  const passed_block_row_t &row = passed_blocks[which];
  const u32 length = (inputs.sink.*row.block).length;
  switch (reason) {
    case COMPOSE_REASON_PASSED_ON:
    case COMPOSE_REASON_NO_ROOM:
      return reason_values(length);
    case COMPOSE_REASON_RATE_BELOW_BLOCK:
      return reason_values(rate_of_2160p60, rate);
    case COMPOSE_REASON_VRR_CHANGED:
      return {};
    default:
      return reason_values(inputs.platform.*row.key, length != 0);
  }
}

void note_left_out(compose_room_item item, u32 count, decisions_t *decisions) {
  if (count == 0) return;
  decisions->note(COMPOSE_SUBJECT_ROOM_ITEM, item, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NO_ROOM,
                  reason_values(count));
}

u32 left_out_of(mode_place_t place, const extended_modes_t &modes) {
  return static_cast<u32>(std::count_if(modes.begin(), modes.end(), [place](const extended_mode_t &mode) {
    return mode.chosen_place == place && mode.place != place;
  }));
}

}  // namespace

void explain_passed_blocks(const layer_inputs_t &inputs, const layer_outcome_t &outcome, decisions_t *decisions) {
  const offer_t &offer = outcome.offer;
  for (u32 i = 0; i < passed_block_count; ++i) {
    const auto which = static_cast<passed_block_t>(i);
    compose_reason reason = judge_passed_block(inputs, which, offer.rate, offer.vrr);
    const bool has_room = outcome.plan.passed[i];
    if (!has_room) reason = COMPOSE_REASON_NO_ROOM;
    decisions->note(COMPOSE_SUBJECT_PASSED_BLOCK, items[i],
                    reason == COMPOSE_REASON_PASSED_ON ? COMPOSE_VERDICT_OFFERED : COMPOSE_VERDICT_LEFT_OUT, reason,
                    values_of(reason, inputs, which, offer.rate));
  }
}

void explain_room_items(const layer_outcome_t &outcome, bool text_left_out, decisions_t *decisions) {
  const plan_t &plan = outcome.plan;
  for (u32 i = 0; i < passed_block_count; ++i)
    note_left_out(items[i], plan.passed[i] ? 0 : 1, decisions);
  note_left_out(COMPOSE_ROOM_3D_STRUCTURES, plan.structures_3d ? 0 : 1, decisions);
  note_left_out(COMPOSE_ROOM_MODES, outcome.base_modes - plan.base_modes, decisions);
  note_left_out(COMPOSE_ROOM_MODES_IN_420, left_out_of(mode_place_t::ycbcr_420_block, plan.extended), decisions);
  note_left_out(COMPOSE_ROOM_EXTENDED_MODES, left_out_of(mode_place_t::video_block, plan.extended), decisions);
  note_left_out(COMPOSE_ROOM_SERIAL_TEXT, text_left_out ? 1 : 0, decisions);
}

}  // namespace edid_composer

#include "edid_composer/hdmi2/extended_mode_explanation.h"

#include "edid_composer/hdmi2/codec/short_video_descriptors.h"

namespace edid_composer {
namespace {

void nominate(u32 vic, compose_origin origin, i32 index, decisions_t *decisions) {
  if (timing_of_extended_vic(vic) != nullptr) {
    decisions->nominate(COMPOSE_SUBJECT_EXTENDED_MODE, vic, origin, index);
  }
}

void nominate_descriptors(const u8 *codes, u32 count, compose_origin origin, decisions_t *decisions) {
  for (u32 i = 0; i < count; ++i)
    nominate(svd_vic(codes[i]), origin, static_cast<i32>(i), decisions);
}

/// A list of the platform, which ends at its first 0.
void nominate_list(const i32 (&vics)[HDMI2_MOST_LISTED_VICS], compose_origin origin, decisions_t *decisions) {
  i32 index = 0;
  for (const i32 vic : vics) {
    if (vic == 0) break;
    nominate(static_cast<u32>(vic), origin, index++, decisions);
  }
}

}  // namespace

void explain_extended_modes(const layer_inputs_t &inputs, const plan_t &plan, decisions_t *decisions) {
  const auto &[base, platform, sink, has_sink] = inputs;
  nominate_descriptors(sink.svds, sink.svd_count, COMPOSE_ORIGIN_SHORT_VIDEO, decisions);
  nominate_descriptors(sink.y420_vics, sink.y420_count, COMPOSE_ORIGIN_SINK_420, decisions);
  nominate_list(platform.vic_priority_list, COMPOSE_ORIGIN_PRIORITY_LIST, decisions);
  nominate_list(platform.vic_addition_list, COMPOSE_ORIGIN_ADDITION_LIST, decisions);
  const extended_modes_t &modes = plan.extended;
  const u32 in_video_block = plan.base_modes + modes.count_in(mode_place_t::video_block);
  for (const extended_mode_t &mode : modes) {
    const u32 there =
        mode.chosen_place == mode_place_t::video_block ? in_video_block : modes.count_in(mode.chosen_place);
    decide(decisions->candidate(COMPOSE_SUBJECT_EXTENDED_MODE, mode.vic()),
           mode.place == mode_place_t::nowhere           ? COMPOSE_VERDICT_LEFT_OUT
           : mode.place == mode_place_t::ycbcr_420_block ? COMPOSE_VERDICT_CHANGED
                                                         : COMPOSE_VERDICT_OFFERED,
           mode.reason, mode.reason == COMPOSE_REASON_NO_ROOM ? reason_values(there) : mode.values);
  }
  for (compose_decision_t &decision : decisions->all()) {
    if (decision.subject != COMPOSE_SUBJECT_EXTENDED_MODE || decision.verdict != 0) continue;
    decide(&decision, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NOT_IN_PRIORITY_LIST);
  }
}

}  // namespace edid_composer

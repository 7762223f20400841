#include "edid_composer/hdmi2/explanation.h"

#include <algorithm>

#include "edid_composer/hdmi2/extended_mode_explanation.h"
#include "edid_composer/hdmi2/passed_blocks.h"
#include "edid_composer/hdmi2/picture_blocks.h"
#include "edid_composer/hdmi2/room_explanation.h"

namespace edid_composer {
namespace {

constexpr i32 never = 0;
constexpr i32 always = 1;

compose_verdict verdict_of(bool offered) {
  return offered ? COMPOSE_VERDICT_OFFERED : COMPOSE_VERDICT_LEFT_OUT;
}

/// Why a tri-state comes out as it does.
compose_reason reason_of(i32 setting, bool sink_has_it) {
  if (setting == never) return COMPOSE_REASON_OFF;
  if (setting == always) return COMPOSE_REASON_BOX_ITSELF;
  return sink_has_it ? COMPOSE_REASON_AS_SINK : COMPOSE_REASON_SINK_WITHOUT;
}

void note_tri_state(compose_subject subject, u32 code, bool offered, i32 setting, bool sink_has_it,
                    decisions_t *decisions) {
  decisions->note(subject, code, verdict_of(offered), reason_of(setting, sink_has_it),
                  reason_values(setting, sink_has_it));
}

void explain_rate(const link_rates_t &rates, u32 rate, decisions_t *decisions) {
  const compose_reason reason = rate > rates.both             ? COMPOSE_REASON_LINK_RATE_OF_ADDED_MODES
                                : rates.sink < rates.platform ? COMPOSE_REASON_LINK_RATE_OF_SINK
                                                              : COMPOSE_REASON_LINK_RATE_OF_BOX;
  decisions->note(COMPOSE_SUBJECT_LINK_RATE, rate, verdict_of(rate > largest_hdmi_rate), reason,
                  reason_values(rates.platform, rates.sink));
}

void explain_picture(const layer_inputs_t &inputs, const hdmi2_t &blocks, decisions_t *decisions) {
  const auto &[base, platform, sink, has_sink] = inputs;
  const u8 eotfs = eotfs_of_sink(sink);
  for (const auto &[eotf, key] : eotf_keys) {
    note_tri_state(COMPOSE_SUBJECT_HDR, eotf, (blocks.eotfs & eotf) != 0, platform.*key, (eotfs & eotf) != 0,
                   decisions);
  }
  const auto note_color_space = [&](hdmi2_colorimetry color_space, i32 setting, bool sink_has_it) {
    note_tri_state(COMPOSE_SUBJECT_COLORIMETRY, color_space, (blocks.colorimetry & color_space) != 0, setting,
                   sink_has_it, decisions);
  };
  for (const auto &[color_space, key] : color_space_keys)
    note_color_space(color_space, platform.*key, (sink.colorimetry & color_space) != 0);
  note_color_space(HDMI2_XVYCC601, base.platform.xvYCC601, base.sink.xvycc601 != 0);
  note_color_space(HDMI2_XVYCC709, base.platform.xvYCC709, base.sink.xvycc709 != 0);
  constexpr u32 of_rgb = 0;
  constexpr u32 of_ycc = 1;
  note_tri_state(COMPOSE_SUBJECT_QUANTIZATION, of_rgb, blocks.rgb_quantization != 0, platform.rgb_quantization,
                 sink.rgb_quantization != 0, decisions);
  note_tri_state(COMPOSE_SUBJECT_QUANTIZATION, of_ycc, blocks.ycc_quantization != 0, platform.ycc_quantization,
                 sink.ycc_quantization != 0, decisions);
}

void explain_420(const layer_inputs_t &inputs, const extended_modes_t &modes, decisions_t *decisions) {
  const i32 setting = inputs.platform.y420;
  const bool sink_has_it = inputs.sink.y420_count != 0 || inputs.sink.y420_map_present != 0;
  const auto count = static_cast<u32>(std::count_if(modes.begin(), modes.end(), [](const extended_mode_t &mode) {
    return mode.place != mode_place_t::nowhere && mode.takes_420;
  }));
  compose_reason reason = reason_of(setting, sink_has_it);
  const bool is_on = reason == COMPOSE_REASON_BOX_ITSELF || reason == COMPOSE_REASON_AS_SINK;
  if (is_on && count == 0) reason = COMPOSE_REASON_NO_MODE_IN_420;
  decisions->note(COMPOSE_SUBJECT_YCBCR_420, count, verdict_of(count != 0), reason,
                  reason_values(setting, sink_has_it));
}

void explain_depths_420(const layer_inputs_t &inputs, const offer_t &offer, decisions_t *decisions) {
  const auto &[base, platform, sink, has_sink] = inputs;
  const auto explain_depth = [&](u32 bits, bool offered, bool above_rate, i32 setting, bool sink_has_it) {
    if (above_rate) {
      decisions->note(COMPOSE_SUBJECT_DEEP_COLOR_420, bits, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_RATE_BELOW_DEPTH,
                      reason_values(offer.rate, setting));
    } else {
      note_tri_state(COMPOSE_SUBJECT_DEEP_COLOR_420, bits, offered, setting, sink_has_it, decisions);
    }
  };
  const depths_420_t &depths = offer.depths_420;
  if (depths.requires_30) {
    decisions->note(COMPOSE_SUBJECT_DEEP_COLOR_420, 30, COMPOSE_VERDICT_CHANGED,
                    COMPOSE_REASON_DEEP_COLOR_420_REQUIRED);
  } else {
    explain_depth(30, depths.bits_30, depths.above_rate_30, platform.dc_30bit_420, sink.dc_30bit_420 != 0);
  }
  explain_depth(36, depths.bits_36, depths.above_rate_36, platform.dc_36bit_420, sink.dc_36bit_420 != 0);
}

void explain_low_latency(const layer_inputs_t &inputs, const offer_t &offer, decisions_t *decisions) {
  const bool allm = offer.blocks.allm != 0;
  note_tri_state(COMPOSE_SUBJECT_ALLM, allm, allm, inputs.platform.allm, inputs.sink.allm != 0, decisions);
  const vrr_offer_t &vrr = offer.vrr;
  if (vrr.reason == COMPOSE_REASON_VRR_RANGE_INVALID) {
    decisions->note(COMPOSE_SUBJECT_VRR, 0, COMPOSE_VERDICT_LEFT_OUT, vrr.reason,
                    reason_values(vrr.range.minimum, vrr.range.maximum, inputs.sink.vrr_min, inputs.sink.vrr_max));
  } else {
    note_tri_state(COMPOSE_SUBJECT_VRR, offer.blocks.vrr_min, vrr.offered, inputs.platform.vrr,
                   inputs.sink.vrr_min != 0, decisions);
  }
}

void explain_uhd_vic(const layer_inputs_t &inputs, const offer_t &offer, bool has_modes, decisions_t *decisions) {
  const compose_reason reason = inputs.platform.uhd_vic == never  ? COMPOSE_REASON_OFF
                                : !has_modes                      ? COMPOSE_REASON_NO_UHD_VIC
                                : offer.blocks.forum_present == 0 ? COMPOSE_REASON_NO_FORUM_BLOCK
                                                                  : COMPOSE_REASON_UHD_VIC_OF_MODES;
  const reason_values_t values = reason == COMPOSE_REASON_OFF
                                     ? reason_values(inputs.platform.uhd_vic, inputs.sink.uhd_vic != 0)
                                     : reason_values_t{};
  decisions->note(COMPOSE_SUBJECT_UHD_VIC, offer.blocks.uhd_vic, verdict_of(offer.blocks.uhd_vic != 0), reason, values);
}

void explain_preferred_timing(const layer_inputs_t &inputs, const extended_modes_t &modes, decisions_t *decisions) {
  const bool wanted = inputs.platform.preferred_extended != 0;
  const extended_mode_t *const first = first_detailed_mode(modes);
  const bool offered = wanted && first != nullptr;
  const compose_reason reason = !wanted            ? COMPOSE_REASON_OFF
                                : first == nullptr ? COMPOSE_REASON_NO_EXTENDED_TIMING
                                                   : COMPOSE_REASON_FIRST_EXTENDED_MODE;
  decisions->note(COMPOSE_SUBJECT_PREFERRED_TIMING, offered ? first->vic() : 0, verdict_of(offered), reason,
                  wanted ? reason_values_t{} : reason_values(inputs.platform.preferred_extended, 0));
}

}  // namespace

void explain_hdmi2(const layer_inputs_t &inputs, const layer_outcome_t &outcome, const edid_t &record,
                   const encoding_t &encoding, decisions_t *decisions) {
  const extended_modes_t &modes = outcome.plan.extended;
  const offer_t &offer = outcome.offer;
  explain_extended_modes(inputs, outcome.plan, decisions);
  explain_rate(outcome.rates, offer.rate, decisions);
  explain_picture(inputs, offer.blocks, decisions);
  explain_420(inputs, modes, decisions);
  explain_depths_420(inputs, offer, decisions);
  explain_low_latency(inputs, offer, decisions);
  explain_passed_blocks(inputs, outcome, decisions);
  explain_uhd_vic(inputs, offer, has_uhd_vic(record, modes), decisions);
  explain_preferred_timing(inputs, modes, decisions);
  explain_room_items(outcome, encoding.text_left_out, decisions);
}

}  // namespace edid_composer

#include "edid_composer/hdmi2/forum_block.h"

#include <algorithm>

#include "edid_composer/hdmi2/platform_values.h"

namespace edid_composer {
namespace {

/// The smaller of two maximums, of which 0 is none.
i32 smaller_maximum(i32 a, i32 b) {
  if (a == 0 || b == 0) return std::max(a, b);
  return std::min(a, b);
}

bool is_valid(const refresh_range_t &range) {
  constexpr i32 largest_minimum = 48;
  constexpr i32 smallest_maximum = 100;
  return range.minimum >= 1 && range.minimum <= largest_minimum &&
         (range.maximum == 0 || range.maximum >= smallest_maximum);
}

bool has_vrr(const hdmi2_t &sink) {
  return sink.vrr_present != 0 && sink.vrr_min != 0;
}

refresh_range_t range_of_sink(const hdmi2_t &sink) {
  return {sink.vrr_min, static_cast<i32>(sink.vrr_max)};
}

/// Whether a mode in 4:2:0 with @p numerator / @p denominator of its plain clock stays within the rate.
bool has_room_for_depth(const extended_modes_t &modes, u32 rate, u32 numerator, u32 denominator) {
  return std::any_of(modes.begin(), modes.end(), [=](const extended_mode_t &mode) {
    const u32 khz = mode.timing->pixel_clock_khz;
    return mode.place != mode_place_t::nowhere && mode.takes_420 &&
           khz * numerator <= rate * khz_per_mhz * 2 * denominator;
  });
}

}  // namespace

vrr_offer_t offer_vrr(const layer_inputs_t &inputs) {
  constexpr i32 never = 0;
  constexpr i32 as_sink = 2;
  const hdmi2_values_t &platform = inputs.platform;
  refresh_range_t range{platform.vrr_min, platform.vrr_max};
  if (platform.vrr == never) return {false, {}, COMPOSE_REASON_OFF};
  if (platform.vrr == as_sink) {
    if (!has_vrr(inputs.sink)) return {false, {}, COMPOSE_REASON_SINK_WITHOUT};
    const refresh_range_t of_sink = range_of_sink(inputs.sink);
    range = {std::max(range.minimum, of_sink.minimum), smaller_maximum(range.maximum, of_sink.maximum)};
  }
  if (!is_valid(range)) return {false, range, COMPOSE_REASON_VRR_RANGE_INVALID};
  return {true, range, platform.vrr == as_sink ? COMPOSE_REASON_AS_SINK : COMPOSE_REASON_BOX_ITSELF};
}

bool is_vrr_of_sink(const layer_inputs_t &inputs, const vrr_offer_t &vrr) {
  if (!vrr.offered || !has_vrr(inputs.sink)) return !vrr.offered && !has_vrr(inputs.sink);
  const refresh_range_t of_sink = range_of_sink(inputs.sink);
  return vrr.range.minimum == of_sink.minimum && vrr.range.maximum == of_sink.maximum;
}

depths_420_t offer_depths_420(const layer_inputs_t &inputs, const extended_modes_t &modes, u32 rate) {
  const bool wants_30 = tri_state(inputs.platform.dc_30bit_420, inputs.sink.dc_30bit_420 != 0);
  const bool wants_36 = tri_state(inputs.platform.dc_36bit_420, inputs.sink.dc_36bit_420 != 0);
  const bool room_30 = has_room_for_depth(modes, rate, 5, 4);
  const bool room_36 = has_room_for_depth(modes, rate, 3, 2);
  const bool bits_36 = wants_36 && room_36;
  const bool bits_30 = wants_30 && room_30;
  return {.bits_30 = bits_30 || bits_36,
          .bits_36 = bits_36,
          .requires_30 = bits_36 && !bits_30,
          .above_rate_30 = wants_30 && !room_30,
          .above_rate_36 = wants_36 && !room_36};
}

bool has_uhd_vic(const edid_t &record, const extended_modes_t &modes) {
  /// By HDMI_VIC, from 1 on.
  constexpr u32 vics[] = {95, 94, 93, 98};
  const u32 *const end = record.hdmi_vic + record.hdmi_vic_len;
  return std::any_of(record.hdmi_vic, end, [&](u32 hdmi_vic) {
    if (hdmi_vic < 1 || hdmi_vic > std::size(vics)) return false;
    return std::any_of(modes.begin(), modes.end(), [&](const extended_mode_t &mode) {
      return mode.place != mode_place_t::nowhere && mode.vic() == vics[hdmi_vic - 1];
    });
  });
}

void fill_forum_block(const layer_inputs_t &inputs, u32 rate, bool uhd_vic, const depths_420_t &depths,
                      const vrr_offer_t &vrr, hdmi2_t *blocks) {
  constexpr u8 version = 1;
  const hdmi2_values_t &platform = inputs.platform;
  const bool above_hdmi_rate = rate > largest_hdmi_rate;
  const bool scdc = above_hdmi_rate || platform.scdc != 0;
  const bool allm = tri_state(platform.allm, inputs.sink.allm != 0);
  if (!scdc && !depths.bits_30 && !allm && !vrr.offered) return;
  blocks->forum_present = 1;
  blocks->forum_version = version;
  blocks->max_tmds_rate = above_hdmi_rate ? rate : 0;
  blocks->scdc = scdc;
  blocks->read_request = scdc && platform.read_request != 0;
  blocks->scramble_low = scdc && platform.scramble_low != 0;
  blocks->uhd_vic = uhd_vic && platform.uhd_vic != 0;
  blocks->dc_30bit_420 = depths.bits_30;
  blocks->dc_36bit_420 = depths.bits_36;
  blocks->allm_present = allm;
  blocks->allm = allm;
  if (!vrr.offered) return;
  blocks->vrr_present = 1;
  blocks->vrr_min = static_cast<u8>(vrr.range.minimum);
  blocks->vrr_max = static_cast<u32>(vrr.range.maximum);
}

}  // namespace edid_composer

#include "edid_composer/hdmi2/hdmi_block.h"

#include <algorithm>

#include "edid_decode_encode/hdmi_vendor_block_layout.h"
#include "linked_list/typed_list.h"
#include "utility/vic_timings.h"

namespace edid_composer {
namespace {

constexpr i32 as_sink = 2;
constexpr u32 khz_of_4k_x_2k = 297000;
constexpr u32 undeclared_to_khz = 165000;

bool is_as_sink(const layer_inputs_t &inputs) {
  return inputs.platform.deep_color == as_sink && inputs.has_sink;
}

/// The largest pixel clock of the first @p count modes, Hz, with what their 3D structures need.
u32 largest_pixel_clock(const ll_list_t &modes, u32 count) {
  u32 largest = 0;
  u32 index = 0;
  for (const auto &mode : elements<const short_video_desc_t>(modes.head)) {
    if (index++ == count) break;
    if (mode.vic < 1 || mode.vic > g_vic_dtd_size) continue;
    largest = std::max(largest, pixel_clock_with_3d(g_vic_dtd[mode.vic - 1].pixel_clock, mode.stereo));
  }
  return largest;
}

/// The largest clock that modes above VIC 64 put on the link; 0 without one.
u32 largest_link_khz(const extended_modes_t &modes) {
  u32 largest = 0;
  for (const extended_mode_t &mode : modes) {
    if (mode.place != mode_place_t::nowhere) largest = std::max(largest, mode.link_khz());
  }
  return largest;
}

}  // namespace

deep_color_t depths_for_sink(const layer_inputs_t &inputs, const deep_color_t &of_platform) {
  if (!is_as_sink(inputs)) return of_platform;
  const bool sink_has_30 = inputs.base.sink.dc_30bit != 0;
  const bool sink_has_36 = inputs.base.sink.dc_36bit != 0;
  return {.bits_30 = of_platform.bits_30 && sink_has_30,
          .bits_36 = of_platform.bits_36 && sink_has_36,
          .requires_36 = of_platform.requires_36 && sink_has_36,
          .sink_lacks_30 = of_platform.bits_30 && !sink_has_30,
          .sink_lacks_36 = of_platform.bits_36 && !sink_has_36};
}

tmds_clock_t tmds_clock_with_extended(const layer_inputs_t &inputs, const base_offer_t &base, const plan_t &plan,
                                      const link_rates_t &rates, u32 rate, const deep_color_t &depths) {
  constexpr u32 hertz_per_khz = 1000;
  const ll_list_t &modes = base.record.video_list;
  const bool has_4k_modes = base.record.hdmi_vic_len != 0;
  const u32 selected = std::min(plan.base_modes, static_cast<u32>(base.population.modes_before_padding));
  tmds_clock_t clock = tmds_clock_for(inputs.base.platform, largest_pixel_clock(modes, selected), has_4k_modes, depths);
  if (rate > largest_hdmi_rate) {
    clock.wanted_mhz = largest_hdmi_rate;
    clock.reason = COMPOSE_REASON_TMDS_OF_LINK;
    clock.values = reason_values(rate);
    return clock;
  }
  const u32 extended_khz = largest_link_khz(plan.extended);
  if (clock.wanted_mhz == 0 && extended_khz <= undeclared_to_khz) return clock;

  const u32 base_khz = up_to_multiple(largest_pixel_clock(modes, plan.base_modes), hertz_per_khz) / hertz_per_khz;
  // As it is told: a platform's own clock is cut to a multiple of 5, not rounded up.
  const u32 told_mhz = hdmi_vendor_block::declared_tmds_clock(clock.held_mhz());
  const u32 of_today_khz = clock.wanted_mhz != 0 ? told_mhz * khz_per_mhz : base_khz;
  const u32 needed = rate_for_clock(std::max({base_khz, has_4k_modes ? khz_of_4k_x_2k : 0, extended_khz}));
  u32 most = std::min(largest_hdmi_rate, std::max(rates.platform, needed));
  if (is_as_sink(inputs) && inputs.base.sink.max_tmds_clock != 0) {
    most = std::min(most, std::max(inputs.base.sink.max_tmds_clock, needed));
  }
  const u32 wanted = rate_for_clock(std::max(of_today_khz, extended_khz));
  if (wanted > most) {
    clock.reason = COMPOSE_REASON_TMDS_LIMITED;
    clock.values = reason_values(wanted, most);
  } else if (wanted != told_mhz) {
    clock.reason = COMPOSE_REASON_TMDS_OF_EXTENDED_MODES;
    clock.values = reason_values(extended_khz);
  }
  clock.wanted_mhz = std::min(wanted, most);
  return clock;
}

}  // namespace edid_composer

#include "edid_composer/new_edid/tmds_clock.h"

#include <algorithm>
#include <cstdint>

#include "linked_list/typed_list.h"

namespace edid_composer {
namespace {

constexpr std::int64_t megahertz = 1000000;

/// How many times the pixels of the flat mode its most demanding 3D structures send.
u32 stereo_factor(u32 stereo) {
  constexpr u32 doubling = STEREO_FRAME_PACKING | STEREO_FIELD_ALTERNATIVE | STEREO_LINE_ALTERNATIVE |
                           STEREO_SIDE_BY_SIDE_FULL | STEREO_L_DEPTH;
  u32 factor = 1;
  if ((stereo & doubling) != 0) factor *= 2;
  if ((stereo & STEREO_L_DEPTH_GRAPHICS) != 0) factor *= 4;
  return factor;
}

/// The TMDS clock that a pixel takes, in percent of the pixel clock.
u32 percent_of_pixel_clock(const deep_color_t &deep_color) {
  if (deep_color.bits_36) return 150;
  return deep_color.bits_30 ? 125 : 100;
}

bool is_overridden(const platform_values_t &platform) {
  constexpr i32 lowest_override = 25;
  return platform.tmds_override >= lowest_override;
}

}  // namespace

u32 tmds_clock_t::held_mhz() const {
  constexpr u32 highest = 1275;
  return std::min(wanted_mhz, highest);
}

tmds_clock_t tmds_clock_for(const platform_values_t &platform, u32 pixel_clock, bool has_4k_modes,
                            const deep_color_t &deep_color) {
  constexpr std::int64_t undeclared_below = 165 * megahertz;
  constexpr std::int64_t clock_of_4k_x_2k = 297 * megahertz;
  if (is_overridden(platform)) {
    return {static_cast<u32>(platform.tmds_override), COMPOSE_REASON_TMDS_OVERRIDE, 0, 0};
  }
  const u32 percent = percent_of_pixel_clock(deep_color);
  if (percent == 100 && pixel_clock < undeclared_below && !has_4k_modes && platform.tmds_override == 0) {
    return {0, COMPOSE_REASON_TMDS_NOT_NEEDED, pixel_clock, percent};
  }
  const std::int64_t of_modes = std::int64_t{pixel_clock} * percent / 100;
  const std::int64_t clock = has_4k_modes ? std::max(of_modes, clock_of_4k_x_2k) : of_modes;
  // kept: a multiple of 5 goes up by 5 too.
  const auto mhz = static_cast<u32>(clock / megahertz);
  return {mhz + 5 - mhz % 5, clock > of_modes ? COMPOSE_REASON_TMDS_OF_4K_MODES : COMPOSE_REASON_TMDS_OF_MODES,
          pixel_clock, percent};
}

tmds_clock_t declare_tmds_clock(const inputs_t &inputs, const ll_list_t &modes, bool has_4k_modes,
                                const deep_color_t &deep_color) {
  const u32 pixel_clock = is_overridden(inputs.platform) ? 0 : _maximum_pixel_clock(&modes);
  return tmds_clock_for(inputs.platform, pixel_clock, has_4k_modes, deep_color);
}

u32 pixel_clock_with_3d(u32 pixel_clock, u32 stereo) {
  return pixel_clock * stereo_factor(stereo);
}

u32 _maximum_pixel_clock(const ll_list_t *vic_list) {
  REPORTS_AS(_maximum_pixel_clock);
  if (vic_list->size == 0) {
    LOG_BUG("\tReceived a list that contains no entries. List:%s", address(vic_list).text);
    return 0;
  }
  u32 maximum = 0;
  for (const auto &video : walk<const short_video_desc_t>(LIST(vic_list, "vic_list"))) {
    detailed_timing_t timing{};
    if (convert_vic_to_dtd(video.vic, &timing) != 1) {
      LOG_BUG("\tFailed converting VIC:%d to a DTD.", video.vic);
      continue;
    }
    maximum = std::max(maximum, pixel_clock_with_3d(timing.pixel_clock, video.stereo));
  }
  return maximum;
}

}  // namespace edid_composer

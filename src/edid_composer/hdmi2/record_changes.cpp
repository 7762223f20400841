#include "edid_composer/hdmi2/record_changes.h"

#include <algorithm>

#include "edid_composer/hdmi2/platform_values.h"
#include "linked_list/typed_list.h"

namespace edid_composer {
namespace {

REPORTS_AS(change_record);

/// Largest value of a byte of the range limits.
constexpr u32 most_rate = 255;

u8 at_least(u8 limit, u32 value) {
  return static_cast<u8>(std::max<u32>(limit, std::min(value, most_rate)));
}

bool change_modes(const plan_t &plan, ll_list_t *modes, entry_arena_t *arena) {
  unlink_elements<short_video_desc_t>(modes, static_cast<i32>(plan.base_modes),
                                      [](i32, const short_video_desc_t &) { return true; });
  if (!plan.structures_3d) {
    for (auto &mode : elements<short_video_desc_t>(modes->head))
      mode.stereo = 0;
  }
  appender_t<short_video_desc_t> added(modes, arena, site);
  for (const extended_mode_t &mode : plan.extended) {
    if (mode.place != mode_place_t::video_block) continue;
    if (!added.append({.native = 0, .vic = mode.vic(), .stereo = 0})) return false;
  }
  return true;
}

/// The modes above VIC 64 within the range limits, by their pixel clocks also in 4:2:0, as drivers compare them.
void widen_range_limits(const extended_modes_t &modes, edid_t *record) {
  constexpr u32 clock_unit = 10;
  constexpr u32 most_clock = most_rate * clock_unit;
  constexpr u32 hertz_per_khz = 1000;
  for (const extended_mode_t &mode : modes) {
    if (mode.place == mode_place_t::nowhere) continue;
    const extended_timing_t &timing = *mode.timing;
    const u32 frames = frame_rate(timing);
    const u32 lines = line_rate(timing);
    const u32 frames_up = frames + (frames * total(timing.vertical) < lines ? 1 : 0);
    const u32 clock_mhz = up_to_multiple(timing.pixel_clock_khz, clock_unit * khz_per_mhz) / khz_per_mhz;
    record->min_v_rate = static_cast<u8>(std::min<u32>(record->min_v_rate, frames));
    record->max_v_rate = at_least(record->max_v_rate, frames_up);
    record->max_h_rate = at_least(record->max_h_rate, up_to_multiple(lines, hertz_per_khz) / hertz_per_khz);
    record->max_pixel_clock = std::max(record->max_pixel_clock, std::min(clock_mhz, most_clock));
  }
}

void widen_to_vrr(const vrr_offer_t &vrr, edid_t *record) {
  if (!vrr.offered) return;
  record->min_v_rate = static_cast<u8>(std::min<i32>(record->min_v_rate, vrr.range.minimum));
  record->max_v_rate = at_least(record->max_v_rate, static_cast<u32>(vrr.range.maximum));
}

/// Puts the first mode above VIC 64 that a detailed timing can hold before the others, if the platform wants so.
bool change_preferred_timing(const layer_inputs_t &inputs, const extended_modes_t &modes, edid_t *record) {
  if (inputs.platform.preferred_extended == 0) return true;
  const extended_mode_t *const first = first_detailed_mode(modes);
  if (first == nullptr) return true;
  return appender_t<detailed_timing_t>(&record->dtd_list, inputs.base.arena, site)
      .prepend(detailed_timing_of(*first->timing));
}

}  // namespace

bool change_record(const layer_inputs_t &inputs, const plan_t &plan, const offer_t &offer, edid_t *record) {
  record->dc_30bit = offer.depths.bits_30;
  record->dc_36bit = offer.depths.bits_36;
  record->dc_y444 = offer.depths.any();
  record->max_tmds_clock = offer.tmds_clock.held_mhz();
  widen_range_limits(plan.extended, record);
  widen_to_vrr(offer.vrr, record);
  return change_modes(plan, &record->video_list, inputs.base.arena) &&
         change_preferred_timing(inputs, plan.extended, record);
}

}  // namespace edid_composer

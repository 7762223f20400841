#include "offered_modes.h"

#include <algorithm>
#include <map>

namespace properties {
namespace {

using test_support::mode_pair_t;

constexpr u32 last_vic_with_timing = 64;

u32 rate_of(const detailed_timing_t &timing) {
  const u32 width = timing.h_active + timing.h_blanking;
  const u32 height = timing.v_active + timing.v_blanking;
  return width == 0 || height == 0 ? 0 : timing.pixel_clock / width / height;
}

u32 height_of(u32 vic) {
  const detailed_timing_t timing = test_support::timing_of_vic(vic);
  return timing.progressive != 0 ? timing.v_active : 2 * timing.v_active;
}

/// 0 when the timing doesn't tell.
u32 family_of(const detailed_timing_t &timing) {
  switch (rate_of(timing)) {
    case 60:
    case 59:
    case 30:
    case 29:
      return 60;
    case 50:
    case 25:
      return 50;
    default:
      return 0;
  }
}

/// What sink and addition list have: VIC and all its 3D structures.
using candidates_t = std::map<u32, u32>;

candidates_t candidates_of(const situation_t &situation, const std::vector<mode_pair_t> &additional) {
  candidates_t candidates;
  for (const u32 vic : situation.sink.timing_vics) {
    if (vic != 0) candidates[vic] |= 0;
  }
  for (const auto &[vic, stereo] : situation.sink.video)
    candidates[vic] |= stereo;
  for (const auto &[vic, stereo] : additional)
    candidates[vic] |= stereo;
  if (situation.platform.geometry_limit == 0) return candidates;
  u32 limit = 0;
  for (const auto &[vic, stereo] : situation.sink.video) {
    if (vic <= last_vic_with_timing) limit = std::max(limit, height_of(vic));
  }
  std::erase_if(candidates, [limit](const auto &candidate) {
    return candidate.first <= last_vic_with_timing && height_of(candidate.first) > limit;
  });
  return candidates;
}

void put_current_mode_first(const situation_t &situation, std::vector<mode_pair_t> *modes) {
  const video_mode_t &mode = situation.settings.hdmi_current_mode;
  const bool plausible = mode.width >= 400 && mode.width <= 16000 && mode.height >= 100 && mode.height <= 8000 &&
                         mode.refresh >= 20 && mode.refresh <= 1000 && mode.interlaced <= 1;
  u32 vic = 0;
  if (situation.platform.current_mode_set_to_priority == 0 || !plausible || mode_to_vic(&mode, &vic) == 0) return;
  const auto same = std::find_if(modes->begin(), modes->end(), [vic](const mode_pair_t &m) { return m.first == vic; });
  if (same != modes->end()) modes->erase(same);
  modes->insert(modes->begin(), {vic, 0});
}

}  // namespace

u32 native_rate_of(const situation_t &situation) {
  const random_sink_t &sink = situation.sink;
  for (const detailed_timing_t &timing : sink.timings) {
    if (const u32 family = family_of(timing); family != 0) return family;
  }
  for (const std_timing_t &timing : sink.std_timings) {
    if (timing.refresh_rate == 60 || timing.refresh_rate == 59) return 60;
  }
  for (const auto &[vic, stereo] : sink.video) {
    if (vic > last_vic_with_timing) continue;
    if (const u32 family = family_of(test_support::timing_of_vic(vic)); family != 0) return family;
  }
  return static_cast<u32>(situation.platform.native_refresh_rate);
}

std::vector<mode_pair_t> modes_to_offer(const situation_t &situation) {
  const bool is_60 = native_rate_of(situation) == 60;
  const auto &platform = situation.platform;
  const candidates_t candidates =
      candidates_of(situation, is_60 ? platform.video_60_additional : platform.video_50_additional);
  std::vector<mode_pair_t> modes;
  for (const auto &[vic, stereo] : is_60 ? platform.video_60_priority : platform.video_50_priority) {
    const auto candidate = candidates.find(vic);
    if (candidate != candidates.end()) modes.emplace_back(vic, stereo & candidate->second);
  }
  put_current_mode_first(situation, &modes);
  while (modes.size() < 4)
    modes.emplace_back(1, 0);
  return modes;
}

std::vector<u32> hdmi_vics_to_offer(const situation_t &situation) {
  std::vector<u32> available = situation.sink.hdmi_vics;
  for (const i32 mode : situation.platform.modes_4k_x_2k_addition)
    available.push_back(static_cast<u32>(mode));
  std::vector<u32> vics;
  for (const i32 mode : situation.platform.modes_4k_x_2k_priority) {
    const auto vic = static_cast<u32>(mode);
    if (std::find(available.begin(), available.end(), vic) != available.end()) vics.push_back(vic);
  }
  return vics;
}

}  // namespace properties

#include "edid_composer/hdmi2/extended_modes.h"

#include <algorithm>
#include <iterator>

#include "edid_composer/hdmi2/codec/short_video_descriptors.h"
#include "edid_composer/hdmi2/platform_values.h"
#include "utility/timing.h"
#include "utility/vic_timings.h"

namespace edid_composer {
namespace {

/// From this clock on modes are sent in 4:2:0 where they are too fast otherwise (HDMI 2.0, section 7.1).
constexpr u32 least_420_khz = 590000;

constexpr u32 half(u32 khz) {
  return (khz + 1) / 2;
}

bool is_listed(const i32 (&list)[HDMI2_MOST_LISTED_VICS], u32 vic) {
  const auto *const end = std::find(std::begin(list), std::end(list), 0);
  return std::find(std::begin(list), end, static_cast<i32>(vic)) != end;
}

/// How the sink names a mode.
struct naming_t {
  bool by_svd = false;
  bool by_420_block = false;
  bool by_420_map = false;
};

naming_t naming_of(const hdmi2_t &sink, u32 vic) {
  naming_t naming;
  for (u32 i = 0; i < sink.svd_count; ++i) {
    if (svd_vic(sink.svds[i]) != vic) continue;
    naming.by_svd = true;
    naming.by_420_map = naming.by_420_map || is_marked_420(sink, i);
  }
  naming.by_420_block =
      std::any_of(sink.y420_vics, sink.y420_vics + sink.y420_count, [vic](u8 code) { return svd_vic(code) == vic; });
  return naming;
}

bool takes_420(const layer_inputs_t &inputs, u32 khz, const naming_t &naming, bool is_addition) {
  if (khz < least_420_khz) return false;
  const bool in_sink_420 = naming.by_420_block || naming.by_420_map;
  const bool anywhere = is_addition || naming.by_svd || naming.by_420_block;
  return inputs.platform.y420 == 1 ? anywhere : tri_state(inputs.platform.y420, in_sink_420);
}

u32 height_of(u32 vic) {
  if (const extended_timing_t *const timing = timing_of_extended_vic(vic); timing != nullptr) {
    return timing->vertical.active;
  }
  return vic >= 1 && vic <= g_vic_dtd_size ? frame_height(timing_of(g_vic_dtd[vic - 1])) : 0;
}

/// That of the tallest short video descriptor; 0 without one.
u32 height_of_sink(const hdmi2_t &sink) {
  u32 tallest = 0;
  for (u32 i = 0; i < sink.svd_count; ++i)
    tallest = std::max(tallest, height_of(svd_vic(sink.svds[i])));
  return tallest;
}

/// Decides on one mode.
class judge_t {
 public:
  judge_t(const layer_inputs_t &inputs, const link_rates_t &rates)
      : inputs_(inputs), rates_(rates), limited_(inputs.base.platform.geometry_limit != 0) {
    if (limited_) tallest_ = height_of_sink(inputs.sink);
  }

  extended_mode_t judge(const extended_timing_t &timing, i32 index) const {
    const u32 khz = timing.pixel_clock_khz;
    const naming_t naming = naming_of(inputs_.sink, timing.vic);
    const bool is_addition = is_listed(inputs_.platform.vic_addition_list, timing.vic);
    const u32 own_khz = rates_.platform * khz_per_mhz;
    const u32 both_khz = rates_.both * khz_per_mhz;
    extended_mode_t mode{.timing = &timing,
                         .index = index,
                         .place = mode_place_t::nowhere,
                         .chosen_place = mode_place_t::nowhere,
                         .takes_420 = takes_420(inputs_, khz, naming, is_addition),
                         .made_by_box = false,
                         .reason = COMPOSE_REASON_NOT_AVAILABLE,
                         .values = {}};
    const u32 height = timing.vertical.active;
    const u32 limit = is_addition ? rates_.platform : rates_.both;
    if (limited_ && height > tallest_) {
      mode.reason = COMPOSE_REASON_TALLER_THAN_SINK;
      mode.values = reason_values(height, tallest_);
    } else if (is_addition && khz <= own_khz) {
      mode.place = mode_place_t::video_block;
      mode.made_by_box = true;
      mode.reason = COMPOSE_REASON_PLATFORM_ADDS_IT;
    } else if (naming.by_svd && khz <= both_khz) {
      mode.place = mode_place_t::video_block;
      mode.reason = COMPOSE_REASON_SINK_HAS_IT;
    } else if (mode.takes_420 && (half(khz) <= both_khz || (is_addition && half(khz) <= own_khz))) {
      mode.place = mode_place_t::ycbcr_420_block;
      mode.made_by_box = half(khz) > both_khz;
      mode.reason = COMPOSE_REASON_ONLY_IN_420;
      mode.values = reason_values(khz, half(khz), limit * khz_per_mhz);
    } else if (is_addition || naming.by_svd || mode.takes_420) {
      mode.reason = COMPOSE_REASON_ABOVE_RATE;
      mode.values = reason_values(khz, limit * khz_per_mhz, is_addition);
    } else if (naming.by_420_block) {
      mode.reason = COMPOSE_REASON_SINK_HAS_IT_IN_420;
      mode.values = reason_values(inputs_.platform.y420);
    }
    mode.chosen_place = mode.place;
    return mode;
  }

 private:
  const layer_inputs_t &inputs_;
  const link_rates_t &rates_;
  bool limited_;
  u32 tallest_ = 0;
};

}  // namespace

u32 extended_mode_t::link_khz() const {
  return place == mode_place_t::ycbcr_420_block ? half(timing->pixel_clock_khz) : timing->pixel_clock_khz;
}

u32 extended_modes_t::count_in(mode_place_t place) const {
  return static_cast<u32>(
      std::count_if(begin(), end(), [place](const extended_mode_t &mode) { return mode.place == place; }));
}

u32 extended_modes_t::drop_last(mode_place_t place) {
  for (u32 i = count; i > 0; --i) {
    extended_mode_t &mode = modes[i - 1];
    if (mode.place != place) continue;
    mode.place = mode_place_t::nowhere;
    mode.reason = COMPOSE_REASON_NO_ROOM;
    mode.values = {};
    return mode.vic();
  }
  return 0;
}

extended_modes_t select_extended_modes(const layer_inputs_t &inputs, const link_rates_t &rates) {
  const judge_t judge(inputs, rates);
  extended_modes_t modes;
  i32 index = 0;
  for (const i32 entry : inputs.platform.vic_priority_list) {
    const extended_timing_t *const timing = timing_of_extended_vic(static_cast<u32>(entry));
    if (timing == nullptr) break;
    const bool is_named_again =
        std::any_of(modes.begin(), modes.end(), [timing](const auto &mode) { return mode.timing == timing; });
    if (!is_named_again) modes.modes[modes.count++] = judge.judge(*timing, index);
    ++index;
  }
  return modes;
}

u32 rate_for_modes(const extended_modes_t &modes, const link_rates_t &rates) {
  constexpr u32 highest = 600;
  u32 rate = rates.both;
  for (const extended_mode_t &mode : modes) {
    if (mode.place != mode_place_t::nowhere && mode.made_by_box) rate = std::max(rate, rate_for_clock(mode.link_khz()));
  }
  return std::min(rate, highest);
}

}  // namespace edid_composer

// What follows from the numbers of a timing.
#pragma once

#include <iterator>

#include "edid_composer.h"

namespace edid_composer {

/// An aspect ratio, by its code.
struct aspect_ratio_t {
  u32 width;
  u32 height;
  const char *name;
};

inline constexpr aspect_ratio_t aspect_ratios[] = {{1, 1, "1:1"}, {4, 3, "4:3"}, {5, 4, "5:4"}, {16, 9, "16:9"}};
inline constexpr u32 aspect_4_3 = 1;
inline constexpr u32 aspect_16_9 = 3;

/// Whole Hz; the field rate of an interlaced timing.
inline u32 refresh_rate(const detailed_timing_t &timing) {
  return calculate_refresh_rate(timing.pixel_clock, timing.h_active, timing.h_blanking, timing.v_active,
                                timing.v_blanking);
}

/// Active lines of a frame, of which an interlaced timing gives half.
inline u32 frame_height(const detailed_timing_t &timing) {
  return timing.progressive != 0 ? timing.v_active : timing.v_active * 2;
}

}  // namespace edid_composer

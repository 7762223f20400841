// The timings of the VICs above 64 (CTA-861, section 4): 65 to 127 and 193 to 219. All are progressive, with positive
// sync pulses.
#pragma once

#include "utility/vic_timings.h"

namespace edid_composer {

struct picture_aspect_t {
  u16 width;
  u16 height;
};

struct extended_timing_t {
  u8 vic;
  u32 pixel_clock_khz;  ///< Up to 5940000, which in Hz would need more than 32 bits.
  raster_t horizontal;
  raster_t vertical;
  picture_aspect_t aspect;
};

/// The timing of a VIC; null for any but 65 to 127 and 193 to 219.
const extended_timing_t *timing_of_extended_vic(u32 vic);

constexpr u32 total(const raster_t &raster) {
  return u32{raster.active} + raster.blanking;
}

/// Lines in a second; a whole number with every timing of the table.
constexpr u32 line_rate(const extended_timing_t &timing) {
  const u32 clocks = total(timing.horizontal);
  return timing.pixel_clock_khz / clocks * 1000 + timing.pixel_clock_khz % clocks * 1000 / clocks;
}

/// Frames in a second; a whole number with every timing of the table.
constexpr u32 frame_rate(const extended_timing_t &timing) {
  return line_rate(timing) / total(timing.vertical);
}

/// True when every field of a detailed timing (EDID 1.3, section 3.10.2) can hold its value.
bool fits_detailed_timing(const extended_timing_t &timing);

/// The detailed timing, for one that fits.
detailed_timing_t detailed_timing_of(const extended_timing_t &timing);

}  // namespace edid_composer

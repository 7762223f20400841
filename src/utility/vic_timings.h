// The table of video timings (CEA-861, section 4), the one place where a VIC's timing is told.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

/// One direction of a raster, in pixels or in lines.
struct raster_t {
  u16 active;
  u16 blanking;
  u16 sync_offset;
  u16 sync_width;
};

/// A timing in the numbers that tell it apart: a third of the room of a detailed timing.
struct vic_timing_t {
  u8 vic;  ///< What a search that ends at this row answers.
  u8 progressive : 1;
  u8 h_sync_positive : 1;
  u8 v_sync_positive : 1;
  u8 wide : 1;  ///< The picture is 16:9, not 4:3.
  u16 pixel_clock_10khz;
  raster_t horizontal;
  raster_t vertical;

  constexpr u32 pixel_clock() const { return pixel_clock_10khz * 10000U; }
};

inline constexpr u32 g_vic_dtd_size = 64;

/// Row i is the timing of VIC i + 1.
extern const vic_timing_t g_vic_dtd[g_vic_dtd_size];

/// A row as a detailed timing. Its image size stands for the picture aspect ratio only.
detailed_timing_t timing_of(const vic_timing_t &row);

}  // namespace edid_composer

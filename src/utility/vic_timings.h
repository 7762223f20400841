// The table of video timings (CEA-861, section 4), the one place that knows a VIC's timing.
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

/// Millimetres.
struct image_size_t {
  u16 width;
  u16 height;
};

/// The timing of a VIC.
struct vic_timing_t {
  u8 vic;           ///< What a search that ends at this row returns.
  u32 pixel_clock;  ///< Hz
  raster_t horizontal;
  raster_t vertical;
  bool progressive;
  bool h_sync_positive;
  bool v_sync_positive;
  image_size_t image_size;  ///< Stands for the picture aspect ratio only.
};

inline constexpr u32 g_vic_dtd_size = 64;

/// Row i is the timing of VIC i + 1.
extern const vic_timing_t g_vic_dtd[g_vic_dtd_size];

/// A row as a detailed timing.
detailed_timing_t timing_of(const vic_timing_t &row);

}  // namespace edid_composer

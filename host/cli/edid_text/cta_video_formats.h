// The video formats above VIC 64 (CTA-861-H, table 3). The library names and offers none of them; sinks list them.
#pragma once

#include <span>

#include "edid_composer.h"

namespace edid_cli {

/// All of them are progressive.
struct cta_video_format_t {
  u32 vic;
  u32 width;
  u32 lines;
  const char *aspect;  ///< "64:27".
  u32 pixel_clock_khz;
  u32 rate_mhz;  ///< Millihertz.
};

/// VICs 65 to 127 and 193 to 219, in order.
std::span<const cta_video_format_t> cta_video_formats();

/// nullptr for any other VIC.
const cta_video_format_t *find_cta_video_format(u32 vic);

}  // namespace edid_cli

// The table of video timings (CEA-861, section 4), the one place where a VIC's timing is told.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

struct vic_timing_t {
  u32 vic;  ///< What a search that ends at this row answers.
  detailed_timing_t timing;
};

inline constexpr u32 g_vic_dtd_size = 64;

/// Row i is the timing of VIC i + 1. The image size stands for the picture aspect ratio only.
extern const vic_timing_t g_vic_dtd[g_vic_dtd_size];

}  // namespace edid_composer

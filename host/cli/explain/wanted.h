// What is asked about: a mode or a format.
#pragma once

#include <string_view>
#include <vector>

#include "edid_composer.h"

namespace edid_cli {

/// One thing that may be wanted: a video mode by its VIC, a 4Kx2K mode by its HDMI_VIC, or an audio type.
struct wanted_t {
  compose_subject subject;
  u32 code;
};

/// "16", "1920x1080p60", "4k:1", "audio:2" or "ac3". More than one where modes differ in their aspect ratio only.
/// Throws bad_input_t.
std::vector<wanted_t> parse_wanted(std::string_view text);

}  // namespace edid_cli

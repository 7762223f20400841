// Video modes as people write them.
#pragma once

#include <string_view>

#include "edid_composer.h"

namespace edid_cli {

/// "1920x1080p60" or "1920x1080i50": width, height of the frame, scan, refresh rate. Throws bad_input_t.
video_mode_t parse_video_mode(std::string_view text);

}  // namespace edid_cli

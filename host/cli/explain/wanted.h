// What is asked about: a mode, a format, or what an EDID may declare besides.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "edid_composer.h"

namespace edid_cli {

struct wanted_t {
  compose_subject subject;  ///< A mode, an audio format, deep colour, 3D, or a feature of HDMI 2.
  u32 code;                 ///< As of a decision: VIC, HDMI_VIC, audio type, bits per pixel; 1 for 3D.
  u32 channels = 0;         ///< Of an audio format: the fewest; 0: any number.
};

/// "16", "vic 95", "1080p60", "1920x1080p60", "4k30", "4k:1", "ac3", "pcm8", "audio:2", "3d", "deep-color", "hdr10",
/// "vrr" and so on. More than one where modes differ in their aspect ratio only. Throws bad_input_t.
std::vector<wanted_t> parse_wanted(std::string_view original);

/// "1920x1080p60 16:9 (VIC 16)".
std::string wanted_name(const wanted_t &wanted);

}  // namespace edid_cli

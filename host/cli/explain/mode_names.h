// Modes and formats as people call them.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "edid_composer.h"

namespace edid_cli {

inline constexpr u32 last_vic = 64;
inline constexpr u32 last_hdmi_vic = 4;
inline constexpr u32 last_audio_type = 18;

/// "1920x1080p60 16:9 (VIC 16)".
std::string video_mode_name(u32 vic);
/// "1920x1080p60".
std::string short_mode_name(u32 vic);
/// "3840x2160p30 (4k:1)".
std::string mode_4k_name(u32 hdmi_vic);
/// "AC3".
std::string audio_type_name(u32 type);
/// "1920x1080p60"; without the lines where they are 0.
std::string raster_name(i32 width, i32 lines, i32 refresh, bool interlaced);

/// The VICs and the HDMI_VICs that are called so, as "720x480p60": more than one where the aspect ratios differ.
std::vector<u32> vics_of_mode(std::string_view name);
std::vector<u32> hdmi_vics_of_mode(std::string_view name);
/// The audio type that is called so, as "ac3"; 0 when there is none.
u32 audio_type_of(std::string_view name);

}  // namespace edid_cli

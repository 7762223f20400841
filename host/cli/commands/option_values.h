// The texts of single options. Each parser throws bad_input_t.
#pragma once

#include <array>
#include <string>
#include <string_view>

#include "composition/composition_options.h"
#include "edid_composer.h"
#include "edid_text/edid_output.h"

namespace edid_cli {

/// Video, audio, interlaced video, interlaced audio; milliseconds.
using latency_t = std::array<u32, 4>;

/// A number of 32 bits, decimal or hexadecimal after 0x.
u32 parse_mask(std::string_view text);

/// One port, or a range such as "0..3". 0 to 14: a nibble of the physical address holds the port counted from 1.
port_range_t parse_ports(std::string_view text);

/// "1920x1080p60" or "1920x1080i50": width, height of the frame, scan, refresh rate.
video_mode_t parse_video_mode(std::string_view text);

/// "off", "sink" or "on".
i32 parse_3d_mode(std::string_view text);

/// Any text but an empty one.
std::string parse_file_name(const std::string &text);

/// "raw" or "hex".
edid_format_t parse_edid_format(std::string_view text);

/// 1 to 256.
u32 parse_jobs(std::string_view text);

/// Four numbers of 16 bits, separated by commas.
latency_t parse_latency(std::string_view text);

}  // namespace edid_cli

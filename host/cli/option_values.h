// The texts of single options. Each parser throws bad_input_t.
#pragma once

#include <array>
#include <string>
#include <string_view>

#include "edid_composer.h"
#include "edid_output.h"

namespace edid_cli {

inline constexpr const char *program_name = "edid-composer";

/// compose_cfg_t::hdmi_3d_mode.
inline constexpr i32 no_3d_mode = 0;
inline constexpr i32 follow_sink_3d_mode = 1;
inline constexpr i32 always_3d_mode = 2;

/// Video, audio, interlaced video, interlaced audio; milliseconds.
using latency_t = std::array<u32, 4>;

/// A number of 32 bits, decimal or hexadecimal behind 0x.
u32 parse_mask(std::string_view text);

/// Inputs of the platform, from the first to the last.
struct port_range_t {
  u32 first = 0;
  u32 last = 0;
  bool is_range = false;  ///< Written as a range, also if of one port.
};

/// One port, or a range such as "0..3". 0 to 14: a nibble of the physical address holds the port counted from 1.
port_range_t parse_ports(std::string_view text);

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

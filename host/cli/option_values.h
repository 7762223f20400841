// The texts of single options. Each parser throws bad_input_t.
#pragma once

#include <array>
#include <string_view>

#include "edid_composer.h"

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

/// 0 to 14: a nibble of the physical address holds the port counted from 1.
u32 parse_port(std::string_view text);

/// "off", "sink" or "on".
i32 parse_3d_mode(std::string_view text);

/// Four numbers of 16 bits, separated by commas.
latency_t parse_latency(std::string_view text);

}  // namespace edid_cli

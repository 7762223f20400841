// Reading an EDID, raw or as hexadecimal text.
#pragma once

#include <string>
#include <vector>

#include "edid_composer.h"

namespace edid_cli {

inline constexpr u32 edid_block_size = 128;

/// The bytes of an EDID: one or more whole blocks. Their content is not looked at. Throws bad_input_t.
std::vector<u8> read_edid(const std::string &file);

}  // namespace edid_cli

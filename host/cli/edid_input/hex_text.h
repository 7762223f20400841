// Bytes written as hexadecimal text.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "edid_composer.h"

namespace edid_cli {

/// Reads an EDID from text: a value of the Windows registry (registry_value.h), an array in C (c_array.h), a block
/// under the heading of another tool (hex_block.h), a dump with offsets (hex_dump.h), or else pairs of hexadecimal
/// digits. White space and commas separate these where wanted, "0x" may stand before a group, and "#" begins a comment
/// that ends with its line.
///
/// Throws bad_input_t, which begins with @p name and, for what is wrong in a line, its number and the column.
std::vector<u8> parse_hex_text(std::string_view text, const std::string &name);

}  // namespace edid_cli

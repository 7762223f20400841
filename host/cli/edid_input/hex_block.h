// Hexadecimal blocks under a heading in the text of another tool, as edid-decode and xrandr --prop write them.
#pragma once

#include <span>
#include <string>
#include <vector>

#include "edid_composer.h"
#include "text/text_lines.h"

namespace edid_cli {

/// Returns whether a heading announces an EDID anywhere in a text.
bool has_hex_block(std::span<const text_line_t> lines);

/// The bytes under the heading, up to the first line after a whole block that does not begin with hexadecimal digits.
/// Throws bad_input_t, also when there is more than one heading.
std::vector<u8> read_hex_block(std::span<const text_line_t> lines, const std::string &name);

}  // namespace edid_cli

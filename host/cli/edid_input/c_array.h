// An EDID as an array in the source text of C and languages like it: what stands in braces, comments left out.
#pragma once

#include <span>
#include <string>
#include <vector>

#include "edid_composer.h"
#include "text/text_lines.h"

namespace edid_cli {

/// Returns whether a text has an opening brace.
bool has_c_array(std::span<const text_line_t> lines);

/// The bytes of the array: numbers as C writes them, hexadecimal with 0x before it. Throws bad_input_t, also when there
/// is more than one array.
std::vector<u8> read_c_array(std::span<const text_line_t> lines, const std::string &name);

}  // namespace edid_cli

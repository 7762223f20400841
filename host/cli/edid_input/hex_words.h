// Bytes written as words of hexadecimal digits.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "edid_composer.h"
#include "text/text_lines.h"

namespace edid_cli {

/// Returns whether a word is hexadecimal digits and nothing else.
bool is_hexadecimal(std::string_view word);

/// Appends what a word of a line stands for: pairs of digits, "0x" may stand before them. Throws bad_input_t, which
/// begins with @p name, line and column.
void append_bytes(std::vector<u8> &bytes, std::string_view word, const text_line_t &line, const std::string &name);

}  // namespace edid_cli

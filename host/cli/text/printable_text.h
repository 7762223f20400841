// Texts from outside on their way to a terminal.
#pragma once

#include <string>
#include <string_view>

namespace edid_cli {

/// With a question mark for each control character: these would break a line, or mean something to a terminal. That
/// holds for U+0080 to U+009F as well, which some terminals obey, and for bytes that are no UTF-8.
std::string printable(std::string_view text);

/// The same for a text of several lines: tabs and the ends of lines stay.
std::string printable_lines(std::string_view text);

}  // namespace edid_cli

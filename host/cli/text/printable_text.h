// Texts from outside on their way to a terminal.
#pragma once

#include <algorithm>
#include <string>
#include <string_view>

namespace edid_cli {

/// With a question mark for each control character: these would break a line, or mean something to a terminal.
inline std::string printable(std::string_view text) {
  std::string result(text);
  std::replace_if(
      result.begin(), result.end(),
      [](char character) { return static_cast<unsigned char>(character) < 0x20 || character == 0x7F; }, '?');
  return result;
}

}  // namespace edid_cli

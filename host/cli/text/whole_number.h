// Whole numbers in texts.
#pragma once

#include <charconv>
#include <optional>
#include <string_view>

#include "edid_composer.h"

namespace edid_cli {

/// The number that the whole text is: digits only, no sign, no blank, no more than 32 bits.
inline std::optional<u32> parse_whole_number(std::string_view text, int base = 10) {
  u32 number = 0;
  const char *const end = text.data() + text.size();
  const auto [stop, error] = std::from_chars(text.data(), end, number, base);
  if (error != std::errc{} || stop != end) {
    return std::nullopt;
  }
  return number;
}

}  // namespace edid_cli

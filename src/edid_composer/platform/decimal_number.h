// Decimal numbers in configuration texts, the same on every target.
#pragma once

#include <cstdint>

#include "edid_composer.h"

namespace edid_composer {

struct decimal_number_t {
  std::int64_t value;  ///< The largest or smallest one for a number that is out of its range.
  const char *rest;    ///< What follows the digits; the text itself when it holds no number.
};

/// Reads blanks, a sign and digits, as strtol does with a 64-bit long.
decimal_number_t read_decimal_number(const char *text);

/// A number of any size, kept to its low 32 bits.
constexpr i32 low_32_bits(std::int64_t number) {
  return static_cast<i32>(static_cast<u32>(static_cast<std::uint64_t>(number)));
}

/// The white space of the C locale.
constexpr bool is_blank(char character) {
  return character == ' ' || (character >= '\t' && character <= '\r');
}

constexpr bool is_digit(char character) {
  return character >= '0' && character <= '9';
}

}  // namespace edid_composer

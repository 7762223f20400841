#include "text/hexadecimal.h"

namespace edid_cli {

std::string hex_digits(std::uint64_t number, std::size_t least_digits, letters_t letters) {
  const char *const digits = letters == letters_t::capital ? "0123456789ABCDEF" : "0123456789abcdef";
  std::string text;
  for (; number != 0 || text.size() < least_digits; number >>= 4) {
    text.insert(text.begin(), digits[number & 0x0F]);
  }
  return text;
}

std::string hex_number(std::uint64_t number, std::size_t least_digits) {
  return "0x" + hex_digits(number, least_digits);
}

std::string hex_bytes(std::span<const std::uint8_t> bytes, std::string_view separator, letters_t letters) {
  std::string text;
  for (const std::uint8_t byte : bytes) {
    text.append(text.empty() ? "" : separator).append(hex_digits(byte, 2, letters));
  }
  return text;
}

}  // namespace edid_cli

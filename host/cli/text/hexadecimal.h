// Numbers and bytes as hexadecimal text.
#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <string_view>

namespace edid_cli {

enum class letters_t { capital, small };

/// Digits only, with zeros before them up to @p least_digits.
std::string hex_digits(std::uint64_t number, std::size_t least_digits, letters_t letters = letters_t::capital);

/// "0x1F".
std::string hex_number(std::uint64_t number, std::size_t least_digits = 1);

/// Two digits for each byte.
std::string hex_bytes(std::span<const std::uint8_t> bytes, std::string_view separator, letters_t letters);

}  // namespace edid_cli

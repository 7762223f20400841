// Bytes as commented hexadecimal text: pairs of digits, "#" begins a comment that ends with its line.
#pragma once

#include <string>
#include <vector>

#include "edid_composer.h"

namespace test_support {

/// The bytes that a text spells. Throws std::invalid_argument when it holds anything else than bytes and comments.
std::vector<u8> bytes_of_hex_text(const std::string &text);

/// The bytes that a file spells. Throws std::runtime_error when it cannot be read.
std::vector<u8> bytes_of_hex_file(const std::string &path);

/// Lines of 16 bytes, each with the offset of its first one: what two EDIDs are compared by.
std::string hex_lines(const std::vector<u8> &bytes);

}  // namespace test_support

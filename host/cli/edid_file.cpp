#include "edid_file.h"

#include <algorithm>
#include <string_view>

#include "bad_input.h"
#include "hex_text.h"
#include "input.h"

namespace edid_cli {
namespace {

/// The base block counts the blocks behind it in one byte.
constexpr std::size_t max_blocks = 256;

bool is_text_character(char character) {
  const auto byte = static_cast<unsigned char>(character);
  return byte >= 0x20 ? byte != 0x7F : (byte >= '\t' && byte <= '\r');
}

/// No text holds the zero bytes of an EDID's header, and hardly an EDID without them holds text only.
bool is_raw(std::string_view content) {
  return !std::all_of(content.begin(), content.end(), is_text_character);
}

}  // namespace

std::vector<u8> read_edid(const std::string &file) {
  const std::string content = read_input(file);
  const std::string name = input_name(file);
  if (content.empty()) {
    throw bad_input_t(name + ": is empty");
  }

  std::vector<u8> bytes =
      is_raw(content) ? std::vector<u8>(content.begin(), content.end()) : parse_hex_text(content, name);
  if (bytes.empty() || bytes.size() % edid_block_size != 0 || bytes.size() > max_blocks * edid_block_size) {
    throw bad_input_t(name + ": " + std::to_string(bytes.size()) +
                      " bytes are not an EDID, which has 1 to 256 blocks of 128 bytes");
  }
  return bytes;
}

}  // namespace edid_cli

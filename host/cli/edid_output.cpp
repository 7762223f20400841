#include "edid_output.h"

namespace edid_cli {
namespace {

constexpr std::size_t bytes_in_line = 16;

std::string hex_lines(std::span<const u8> edid) {
  constexpr char digits[] = "0123456789abcdef";
  std::string text;
  for (std::size_t offset = 0; offset < edid.size(); ++offset) {
    text += digits[edid[offset] >> 4];
    text += digits[edid[offset] & 0x0F];
    text += (offset + 1) % bytes_in_line == 0 ? '\n' : ' ';
  }
  return text;
}

}  // namespace

std::string formatted(std::span<const u8> edid, edid_format_t format) {
  return format == edid_format_t::hex ? hex_lines(edid) : std::string(edid.begin(), edid.end());
}

const char *file_ending(edid_format_t format) {
  return format == edid_format_t::hex ? ".hex" : ".bin";
}

}  // namespace edid_cli

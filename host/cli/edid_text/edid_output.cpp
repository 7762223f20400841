#include "edid_text/edid_output.h"

#include <algorithm>

#include "text/hexadecimal.h"

namespace edid_cli {
namespace {

constexpr std::size_t bytes_in_line = 16;

std::string hex_lines(std::span<const u8> edid) {
  std::string text;
  for (; !edid.empty(); edid = edid.subspan(std::min(bytes_in_line, edid.size()))) {
    text += hex_bytes(edid.first(std::min(bytes_in_line, edid.size())), " ", letters_t::small) + "\n";
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

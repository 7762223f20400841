#include "annotation.h"
#include "text_format.h"

namespace golden {
namespace {

std::string rates(u8 byte) {
  static const char *const names[] = {"32", "44.1", "48", "88.2", "96", "176.4", "192"};
  std::string text;
  for (unsigned bit = 0; bit < 7; ++bit) {
    if ((byte >> bit & 1U) != 0) text += format("%s%s", text.empty() ? "" : "/", names[bit]);
  }
  return text + " kHz";
}

std::string sizes(u8 byte) {
  std::string text;
  for (unsigned bit = 0; bit < 3; ++bit) {
    if ((byte >> bit & 1U) != 0) text += format("%s%u", text.empty() ? "" : "/", 16 + 4 * bit);
  }
  return text + " bits";
}

/// What the third byte says depends on the format.
std::string detail(unsigned code, u8 byte) {
  if (code == 1) return sizes(byte);
  if (code >= 2 && code <= 8) return format("%u kbit/s", byte * 8U);
  if (code == 14) return format("profile %u", byte & 7U);
  if (code == 15) return format("extension code %u", byte >> 3U);
  return format("value %u", byte);
}

}  // namespace

void annotate_audio_block(annotated_hex_t &hex, std::size_t length) {
  for (; length >= 3; length -= 3) {
    const unsigned code = hex.next(0) >> 3U & 0xFU;
    hex.field(3, format("%s, %u channels, %s, %s", short_audio_string(code), (hex.next(0) & 7U) + 1,
                        rates(hex.next(1)).c_str(), detail(code, hex.next(2)).c_str()));
  }
}

}  // namespace golden

#include <algorithm>

#include "annotation.h"
#include "text_format.h"

namespace golden {
namespace {

constexpr std::size_t descriptor_size = 18;

/// A number whose high bits stand in another byte.
unsigned joined(u8 low, unsigned high) {
  return low + high * 256U;
}

std::string timing(const annotated_hex_t &hex) {
  const unsigned clock = joined(hex.next(0), hex.next(1));
  const unsigned width = joined(hex.next(2), hex.next(4) >> 4U);
  const unsigned total_width = width + joined(hex.next(3), hex.next(4) & 0xFU);
  const unsigned lines = joined(hex.next(5), hex.next(7) >> 4U);
  const unsigned total_lines = lines + joined(hex.next(6), hex.next(7) & 0xFU);
  const u8 flags = hex.next(17);
  const bool interlaced = (flags & 0x80) != 0;
  const unsigned total = std::max(total_width * total_lines, 1U);
  const unsigned rate = (clock * 10000 + total / 2) / total;
  return format("%ux%u%c%u, %u.%02u MHz, %u x %u mm, sync %c %c", width, interlaced ? 2 * lines : lines,
                interlaced ? 'i' : 'p', rate, clock / 100, clock % 100, joined(hex.next(12), hex.next(14) >> 4U),
                joined(hex.next(13), hex.next(14) & 0xFU), (flags & 2) != 0 ? '+' : '-', (flags & 4) != 0 ? '+' : '-');
}

std::string quoted_text(const annotated_hex_t &hex) {
  std::string text;
  for (std::size_t at = 5; at < descriptor_size && hex.next(at) != '\n'; ++at) {
    const u8 character = hex.next(at);
    text += character >= 0x20 && character < 0x7F ? static_cast<char>(character) : '?';
  }
  return "\"" + text + "\"";
}

std::string display_descriptor(const annotated_hex_t &hex) {
  switch (hex.next(3)) {
    case 0xFF:
      return "serial number " + quoted_text(hex);
    case 0xFE:
      return "text " + quoted_text(hex);
    case 0xFC:
      return "name " + quoted_text(hex);
    case 0xFD:
      return format("limits: %u-%u Hz, %u-%u kHz, %u MHz", hex.next(5), hex.next(6), hex.next(7), hex.next(8),
                    hex.next(9) * 10U);
    default:
      return format("descriptor of tag 0x%02X", hex.next(3));
  }
}

}  // namespace

void annotate_descriptor(annotated_hex_t &hex) {
  const bool is_timing = hex.next(0) != 0 || hex.next(1) != 0;
  hex.field(descriptor_size, is_timing ? timing(hex) : display_descriptor(hex));
}

}  // namespace golden

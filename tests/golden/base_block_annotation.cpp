#include "annotation.h"
#include "text_format.h"

namespace golden {
namespace {

std::string manufacturer(u8 high, u8 low) {
  const unsigned letters = high * 256U + low;
  std::string name;
  for (const unsigned shift : {10U, 5U, 0U})
    name += static_cast<char>('@' + ((letters >> shift) & 0x1F));
  return name;
}

std::string features(u8 byte) {
  auto names = set_bits(byte, {{0x80, "stand-by"}, {0x40, "suspend"}, {0x20, "active-off"}});
  static const char *const colour_types[] = {"monochrome", "RGB colour", "other colour", "colour type undefined"};
  names.emplace_back(colour_types[(byte >> 3) & 3]);
  for (auto &name : set_bits(byte, {{0x04, "sRGB"}, {0x02, "first timing preferred"}, {0x01, "GTF"}}))
    names.push_back(name);
  return listed(names);
}

/// The low bits of four coordinates stand in one byte, the high bits of each in one of its own.
std::string primaries(const annotated_hex_t &hex) {
  static const char *const colours[] = {"red", "green", "blue", "white"};
  std::string text;
  for (unsigned coordinate = 0; coordinate < 8; ++coordinate) {
    const unsigned low = (hex.next(coordinate / 4) >> (6 - 2 * (coordinate % 4))) & 3U;
    const unsigned value = hex.next(2 + coordinate) * 4U + low;
    if (coordinate % 2 == 0) text += format("%s%s", coordinate == 0 ? "" : ", ", colours[coordinate / 2]);
    text += format(" %u", value);
  }
  return text;
}

std::string timings_of_byte(u8 byte, const char *(*name)(u32)) {
  std::vector<std::string> names;
  for (unsigned bit = 0x80; bit != 0; bit >>= 1) {
    if ((byte & bit) != 0) names.emplace_back(name(bit));
  }
  return listed(names);
}

std::string standard_timing(u8 a, u8 b) {
  if (a == 1 && b == 1) return "standard timing: none";
  // EDID 1.3 reads code 0 as 16:10; here it is the older 1:1.
  struct ratio_t {
    unsigned width, height;
  };
  static const ratio_t ratios[] = {{1, 1}, {4, 3}, {5, 4}, {16, 9}};
  const ratio_t ratio = ratios[b >> 6];
  const unsigned width = (a + 31U) * 8;
  return format("standard timing: %ux%up%u, %u:%u", width, width * ratio.height / ratio.width, (b & 0x3FU) + 60,
                ratio.width, ratio.height);
}

void annotate_identity(annotated_hex_t &hex) {
  hex.field(8, "header");
  hex.field(2, "manufacturer " + manufacturer(hex.next(0), hex.next(1)));
  hex.field(2, format("product code 0x%04X", hex.next(0) + 256U * hex.next(1)));
  const unsigned long serial =
      hex.next(0) + 0x100UL * hex.next(1) + 0x10000UL * hex.next(2) + 0x1000000UL * hex.next(3);
  hex.field(4, format("serial number %lu", serial));
  hex.field(2, format("week %u of %u", hex.next(0), 1990U + hex.next(1)));
  hex.field(2, format("EDID %u.%u", hex.next(0), hex.next(1)));
}

void annotate_display(annotated_hex_t &hex) {
  hex.field(1, (hex.next() & 0x80) != 0 ? "digital input" : "analogue input");
  hex.field(2, format("%u x %u cm", hex.next(0), hex.next(1)));
  hex.field(1, format("gamma %u.%02u", (hex.next() + 100U) / 100, (hex.next() + 100U) % 100));
  hex.field(1, features(hex.next()));
  hex.field(10, primaries(hex));
}

void annotate_timings(annotated_hex_t &hex) {
  hex.field(1, "established: " + timings_of_byte(hex.next(), est_timing_1_string));
  hex.field(1, "established: " + timings_of_byte(hex.next(), est_timing_2_string));
  hex.field(1, "manufacturer's: " + timings_of_byte(hex.next(), man_timing_string));
  for (int slot = 0; slot < 8; ++slot)
    hex.field(2, standard_timing(hex.next(0), hex.next(1)));
}

}  // namespace

void annotate_base_block(annotated_hex_t &hex) {
  const std::span<const u8> block = hex.rest().first(block_size);
  annotate_identity(hex);
  annotate_display(hex);
  annotate_timings(hex);
  for (int descriptor = 0; descriptor < 4; ++descriptor)
    annotate_descriptor(hex);
  hex.field(1, format("%u extension block%s", hex.next(), hex.next() == 1 ? "" : "s"));
  annotate_checksum(hex, block);
}

}  // namespace golden

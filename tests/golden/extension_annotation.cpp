#include <algorithm>
#include <numeric>

#include "annotation.h"
#include "text_format.h"

namespace golden {
namespace {

constexpr std::size_t descriptor_size = 18;

std::string flags(u8 byte) {
  auto names = set_bits(byte, {{0x80, "underscan"}, {0x40, "basic audio"}, {0x20, "YCbCr 4:4:4"}, {0x10, "4:2:2"}});
  names.push_back(format("%u native timings", byte & 0x0FU));
  return listed(names);
}

void annotate_speakers(annotated_hex_t &hex, std::size_t length) {
  const unsigned bits = hex.next(0) + 256U * hex.next(1);
  hex.field(length, listed(set_bits(bits, {{0x001, "FL/FR"},
                                           {0x002, "LFE"},
                                           {0x004, "FC"},
                                           {0x008, "RL/RR"},
                                           {0x010, "RC"},
                                           {0x020, "FLC/FRC"},
                                           {0x040, "RLC/RRC"},
                                           {0x080, "FLW/FRW"},
                                           {0x100, "FLH/FRH"},
                                           {0x200, "TC"},
                                           {0x400, "FCH"}})));
}

void annotate_video_modes(annotated_hex_t &hex, std::size_t length) {
  for (std::size_t index = 0; index < length; ++index) {
    const u8 descriptor = hex.next();
    const u32 vic = descriptor & 0x7FU;
    hex.field(1, format("%zu: VIC %u, %s%s", index, vic, short_video_timing_string(vic),
                        (descriptor & 0x80) != 0 ? ", native" : ""));
  }
}

void annotate_extended_block(annotated_hex_t &hex, std::size_t length) {
  constexpr u8 colorimetry = 5;
  if (hex.next() != colorimetry || length != 3) {
    hex.field(length, format("extended tag %u", hex.next()));
    return;
  }
  auto names = set_bits(hex.next(1), {{0x01, "xvYCC601"}, {0x02, "xvYCC709"}});
  for (auto &name : set_bits(hex.next(2), {{0x01, "MD0"}, {0x02, "MD1"}, {0x04, "MD2"}, {0x08, "MD3"}}))
    names.push_back(name);
  hex.field(length, "colorimetry: " + listed(names));
}

void annotate_data_block(annotated_hex_t &hex) {
  static const char *const tags[] = {
      "reserved (tag 0)", "audio",       "video", "vendor-specific", "speaker allocation", "VESA DTC",
      "reserved (tag 6)", "extended tag"};
  const unsigned tag = hex.next() >> 5U;
  const std::size_t length = hex.next() & 0x1FU;
  hex.field(1, format("%s data block, %zu bytes", tags[tag], length));
  const std::size_t end = hex.position() + length;
  switch (tag) {
    case 1:
      annotate_audio_block(hex, length);
      break;
    case 2:
      annotate_video_modes(hex, length);
      break;
    case 3:
      annotate_vendor_block(hex, length);
      break;
    case 4:
      annotate_speakers(hex, length);
      break;
    case 7:
      annotate_extended_block(hex, length);
      break;
    default:
      break;
  }
  if (hex.position() < end) hex.field(end - hex.position(), "not known");
}

void annotate_padding(annotated_hex_t &hex, std::size_t end) {
  const std::size_t count = end - hex.position();
  const auto padding = hex.rest().first(count);
  const bool is_clear = std::all_of(padding.begin(), padding.end(), [](u8 byte) { return byte == 0; });
  hex.field(count, is_clear ? format("unused, %zu bytes", count) : "unused, but not clear");
}

}  // namespace

void annotate_extension(annotated_hex_t &hex) {
  const std::size_t start = hex.position();
  const std::span<const u8> block = hex.rest().first(block_size);
  const std::size_t timings = start + block[2];
  const std::size_t checksum = start + block_size - 1;
  hex.field(2, format("extension of tag %u, revision %u", block[0], block[1]));
  hex.field(1, format("detailed timings begin at byte %u", block[2]));
  hex.field(1, flags(block[3]));
  while (hex.position() < std::min(timings, checksum))
    annotate_data_block(hex);

  // A descriptor begins with its clock, or with two zeros and a tag at byte 3.
  while (hex.position() + descriptor_size <= checksum && (hex.next(0) != 0 || hex.next(1) != 0 || hex.next(3) != 0))
    annotate_descriptor(hex);
  if (hex.position() < checksum) annotate_padding(hex, checksum);
  annotate_checksum(hex, block);
}

void annotate_checksum(annotated_hex_t &hex, std::span<const u8> block) {
  const unsigned sum = std::accumulate(block.begin(), block.end(), 0U);
  hex.field(1, sum % 256 == 0 ? "checksum" : "checksum: WRONG");
}

std::string annotated(std::span<const u8> edid) {
  annotated_hex_t hex(edid);
  hex.remark("--- Base block");
  annotate_base_block(hex);
  hex.blank_line();
  hex.remark("--- CEA-861 extension");
  annotate_extension(hex);
  // Nothing is left when the lengths in the block are right.
  hex.field(hex.remaining(), "behind the block");
  return hex.text();
}

}  // namespace golden

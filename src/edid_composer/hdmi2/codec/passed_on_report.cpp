#include "edid_composer/hdmi2/codec/passed_on_report.h"

#include <algorithm>

#include "edid_composer/hdmi2/codec/passed_on_blocks.h"
#include "edid_composer/hdmi2/codec/report_lines.h"
#include "output.h"

namespace edid_composer {
namespace {

/// Heading and bytes; false when there is no such block.
bool print_block(const char *heading, const byte_view_t &payload) {
  if (!print_heading(heading, payload.size() != 0)) return false;
  print_label("Bytes");
  const char *separator = "";
  for (const u8 byte : payload) {
    print("%s%02X", separator, byte);
    separator = " ";
  }
  print("\n");
  return true;
}

/// Types of metadata one after the other, each with the length of what follows it ahead of it.
void print_dynamic_metadata(const byte_view_t &payload) {
  constexpr u32 first = 1;
  constexpr u32 type = 1;
  constexpr u32 version = 3;
  constexpr u8 version_mask = 0x0F;
  constexpr u32 least_length = 2;
  for (u32 at = first; payload[at] >= least_length; at += 1 + payload[at]) {
    print_number("Metadata type", payload.little_endian_16(at + type), "");
    if (payload[at] > least_length) print_number("Version of the type", payload[at + version] & version_mask, "");
  }
}

void print_dolby_vision(const hdmi2_block_t &block) {
  print_number("Version", dolby_vision_version(block), "");
  if (dolby_vision_version(block) <= 1) print_support("2160p60", dolby_vision_has_2160p60(block));
}

void print_freesync(const byte_view_t &payload) {
  constexpr u32 version = 3;
  constexpr u32 slowest = 5;
  constexpr u32 fastest = 6;
  print_number("Version", payload[version], "");
  print_number("Min refresh rate", payload[slowest], " Hz");
  print_number("Max refresh rate", payload[fastest], " Hz");
}

byte_view_t payload_of(const hdmi2_block_t &block) {
  return {block.payload, std::min<u32>(block.length, HDMI2_MOST_BLOCK_BYTES)};
}

}  // namespace

void print_passed_on_blocks(const hdmi2_t &hdmi2) {
  constexpr u32 hdr10plus_version = 4;
  const byte_view_t dynamic = payload_of(hdmi2.hdr_dynamic);
  const byte_view_t hdr10plus = payload_of(hdmi2.hdr10plus);
  const byte_view_t freesync = payload_of(hdmi2.freesync);
  if (print_block("HDR dynamic metadata", dynamic)) print_dynamic_metadata(dynamic);
  if (print_block("HDR10+", hdr10plus)) print_number("Application version", hdr10plus[hdr10plus_version] & 0x03, "");
  if (print_block("Dolby Vision", payload_of(hdmi2.dolby_vision))) print_dolby_vision(hdmi2.dolby_vision);
  if (print_block("FreeSync", freesync)) print_freesync(freesync);
}

}  // namespace edid_composer

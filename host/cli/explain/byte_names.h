// What each byte of an EDID is: EDID 1.3, CTA-861, HDMI.
#pragma once

#include <span>
#include <string>
#include <vector>

#include "edid_composer.h"

namespace edid_cli {

/// Parts of an EDID, each with a colour of its own.
enum class byte_block_t {
  identity,
  display,
  timings,
  descriptor,
  extension,
  speakers,
  video,
  audio,
  hdmi,
  forum,
  capability,
  colorimetry,
  hdr,
  y420,
  freesync,
  other,
  unused
};
inline constexpr std::size_t byte_block_count = static_cast<std::size_t>(byte_block_t::unused) + 1;

/// "Video data block".
const char *byte_block_title(byte_block_t block);
/// "video", for style sheets.
const char *byte_block_id(byte_block_t block);

/// Bytes that mean something together.
struct byte_field_t {
  std::size_t offset;
  std::size_t size;
  byte_block_t block;
  std::string name;
  std::string meaning;
};

/// The fields of an EDID of any number of blocks: each byte is in one field, in order. Of extensions that are not
/// CTA-861's only the tag and the checksum are looked at.
std::vector<byte_field_t> name_bytes(std::span<const u8> edid);

}  // namespace edid_cli

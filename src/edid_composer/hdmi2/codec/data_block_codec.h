// What every data block of HDMI 2 has in common (CTA-861, section 7.4): how it is recognised, and that one file reads
// it and writes it. Offsets are counted from the block's header byte, as in the standards' tables.
#pragma once

#include "bytes.h"
#include "edid_decode_encode/cea_extension_layout.h"

namespace edid_composer {

/// Longest identifier after the header byte: extended tag and OUI.
inline constexpr u32 longest_identifier = 4;

/// How a block is recognised: the tag in its header byte, and the bytes that follow it.
struct block_identity_t {
  const char *name;
  u32 tag;
  u8 identifier[longest_identifier];  ///< Extended tag, OUI with its lowest byte first, or both.
  u32 identifier_size;
  u32 least_payload;  ///< Payload bytes, identifier included; a shorter block is as good as none.
};

/// True when the block that begins at the first byte of @p block has this identity, whatever its length.
bool is_block(const block_identity_t &identity, const byte_view_t &block);

/// A block's two directions.
struct block_codec_t {
  block_identity_t identity;
  /// Reads a block that is long enough: @p block is its header byte and its payload, no more. Sets every field that the
  /// block has in a record.
  void (*read)(const byte_view_t &block, hdmi2_t *hdmi2);
  /// Payload bytes of the record's block, identifier included; 0: the record has none.
  u32 (*payload)(const hdmi2_t &hdmi2);
  /// Writes what follows the identifier, where there is a payload.
  void (*write)(const hdmi2_t &hdmi2, byte_writer_t *blocks);
};

/// Bytes that write_block() adds, header byte included; 0: the record has no such block.
u32 size_of_block(const block_codec_t &codec, const hdmi2_t &hdmi2);

/// Writes the whole block, where the record has it. The writer counts what has no room.
void write_block(const block_codec_t &codec, const hdmi2_t &hdmi2, byte_writer_t *blocks);

/// A bit of a byte, as a member.
constexpr u8 bit_of(u8 byte, u8 mask) {
  return (byte & mask) != 0 ? 1 : 0;
}

/// A member as a bit.
constexpr u32 bit_if(u8 member, u8 mask) {
  return member != 0 ? mask : 0U;
}

}  // namespace edid_composer

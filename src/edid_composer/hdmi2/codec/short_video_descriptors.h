// Short video descriptors with VICs up to 255 (CTA-861, section 7.5.1), and the video data blocks that hold them.
#pragma once

#include "bytes.h"
#include "edid_decode_encode/cea_extension_layout.h"

namespace edid_composer {

/// What a short video descriptor says.
struct svd_t {
  u32 vic;
  bool native;
};

/// Codes from 65 to 127 and from 193 on are VICs as they stand. Others have a native flag above 7 bits of VIC.
constexpr svd_t decode_svd(u8 code) {
  const u32 low_bits = code & u32{short_video::vic_mask};
  const bool whole_byte = ((code - 1U) & 0x40) != 0 && low_bits != 0;
  return whole_byte ? svd_t{code, false} : svd_t{low_bits, (code & short_video::native) != 0};
}

constexpr u32 svd_vic(u8 code) {
  return decode_svd(code).vic;
}

/// True when bit @p index of the record's 4:2:0 capability map is set, or the map is there without a byte, which stands
/// for all descriptors. False without a map.
bool is_marked_420(const hdmi2_t &hdmi2, u32 index);

/// Adds the descriptors of a video data block to the record's: @p block is its header byte and its payload.
void read_video_block(const byte_view_t &block, hdmi2_t *hdmi2);

/// Bytes that write_video_blocks() adds: descriptors and a header byte for every 31 of them.
u32 video_blocks_size(const hdmi2_t &hdmi2);

/// Writes the record's descriptors in as few video data blocks as hold them.
void write_video_blocks(const hdmi2_t &hdmi2, byte_writer_t *blocks);

}  // namespace edid_composer

// The data blocks of HDMI 2, but for the video data block (short_video_descriptors.h).
#pragma once

#include "edid_composer/hdmi2/codec/data_block_codec.h"

namespace edid_composer {

extern const block_codec_t hdmi_forum_block;
extern const block_codec_t video_capability_block;
extern const block_codec_t colorimetry_block;
extern const block_codec_t hdr_static_block;
extern const block_codec_t ycbcr_420_video_block;
extern const block_codec_t ycbcr_420_map_block;
extern const block_codec_t hdr_dynamic_block;
extern const block_codec_t hdr10plus_block;
extern const block_codec_t dolby_vision_block;
extern const block_codec_t freesync_block;

/// The sink capability data structure: what the HDMI Forum block holds, under an extended tag. It is only read.
extern const block_identity_t sink_capability_structure;

/// All of them, in the order in which they are written.
inline constexpr const block_codec_t *hdmi2_blocks[] = {
    &hdmi_forum_block,    &video_capability_block, &colorimetry_block, &hdr_static_block,   &ycbcr_420_video_block,
    &ycbcr_420_map_block, &hdr_dynamic_block,      &hdr10plus_block,   &dolby_vision_block, &freesync_block,
};

/// Bytes that write_hdmi2_blocks() adds.
u32 hdmi2_blocks_size(const hdmi2_t &hdmi2);

/// Writes the blocks that the record has. The writer counts what has no room, so that size and position show it.
void write_hdmi2_blocks(const hdmi2_t &hdmi2, byte_writer_t *blocks);

}  // namespace edid_composer

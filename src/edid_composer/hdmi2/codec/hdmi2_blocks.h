// The data blocks of HDMI 2, but for the video data block (short_video_descriptors.h).
#pragma once

#include "edid_composer/hdmi2/codec/colorimetry_block.h"
#include "edid_composer/hdmi2/codec/hdmi_forum_block.h"
#include "edid_composer/hdmi2/codec/hdr_static_block.h"
#include "edid_composer/hdmi2/codec/passed_on_blocks.h"
#include "edid_composer/hdmi2/codec/video_capability_block.h"
#include "edid_composer/hdmi2/codec/ycbcr_420_map_block.h"
#include "edid_composer/hdmi2/codec/ycbcr_420_video_block.h"

namespace edid_composer {

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

// The blocks that are kept as they stand, to be passed on byte for byte: the HDR dynamic metadata data block (CTA-861,
// section 7.5.14) and three of vendors.
#pragma once

#include "edid_composer/hdmi2/codec/data_block_codec.h"

namespace edid_composer {

extern const block_codec_t hdr_dynamic_block;
extern const block_codec_t hdr10plus_block;
extern const block_codec_t dolby_vision_block;
extern const block_codec_t freesync_block;

/// Version of a Dolby Vision block.
u32 dolby_vision_version(const hdmi2_block_t &block);

/// True when the block announces 2160p60, which its versions 0 and 1 say.
bool dolby_vision_has_2160p60(const hdmi2_block_t &block);

}  // namespace edid_composer

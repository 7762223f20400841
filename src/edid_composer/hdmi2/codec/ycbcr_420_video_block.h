// The YCbCr 4:2:0 video data block (CTA-861, section 7.5.10): the modes that are taken in 4:2:0 only.
#pragma once

#include "edid_composer/hdmi2/codec/data_block_codec.h"

namespace edid_composer {

extern const block_codec_t ycbcr_420_video_block;

}  // namespace edid_composer

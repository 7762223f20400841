// The YCbCr 4:2:0 capability map data block (CTA-861, section 7.5.11): which short video descriptors are taken in 4:2:0
// too. Without a map it stands for all of them.
#pragma once

#include "edid_composer/hdmi2/codec/data_block_codec.h"

namespace edid_composer {

extern const block_codec_t ycbcr_420_map_block;

}  // namespace edid_composer

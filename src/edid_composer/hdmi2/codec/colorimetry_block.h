// The colorimetry data block (CTA-861, section 7.5.5).
#pragma once

#include "edid_composer/hdmi2/codec/data_block_codec.h"

namespace edid_composer {

extern const block_codec_t colorimetry_block;

}  // namespace edid_composer

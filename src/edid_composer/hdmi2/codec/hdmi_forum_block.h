// The HDMI Forum vendor-specific data block (HDMI 2.0 and 2.1), and the sink capability data structure, which holds the
// same from byte 4 on.
#pragma once

#include "edid_composer/hdmi2/codec/data_block_codec.h"

namespace edid_composer {

extern const block_codec_t hdmi_forum_block;

/// The same under an extended tag. It is only read.
extern const block_identity_t sink_capability_structure;

}  // namespace edid_composer

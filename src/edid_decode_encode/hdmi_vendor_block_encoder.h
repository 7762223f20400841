// Encoding of the HDMI vendor-specific data block (HDMI 1.4a, section 8.3.2).
#pragma once

#include "bytes.h"

namespace edid_composer {

/// Writes the block. Mandatory 3D structures are cleared from the masks of the video list.
void encode_hdmi_vendor_block(edid_t *edid, byte_writer_t *extension);

}  // namespace edid_composer

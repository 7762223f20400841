// Encoding of the HDMI vendor-specific data block (HDMI 1.4a, section 8.3.2).
#pragma once

#include "bytes.h"

namespace edid_composer {

/// Writes the block. Mandatory 3D structures are cleared from the masks of the video list.
void encode_hdmi_vendor_block(edid_t *edid, byte_writer_t *extension);

/// Bytes of the 3D structures that the block holds for the first @p modes of a sound list of modes.
u32 written_3d_bytes(const edid_t &edid, u32 modes);

/// Payload bytes of the block, of which the 3D structures take @p bytes_3d. A length field holds 31.
u32 hdmi_vendor_block_length(const edid_t &edid, u32 bytes_3d);

}  // namespace edid_composer

// Encoding of the HDMI vendor-specific data block (HDMI 1.4a, section 8.3.2).
#pragma once

#include "bytes.h"
#include "diagnostics.h"

namespace edid_composer {

/// Writes the block in the name of @p site. Mandatory 3D structures are cleared from the masks of the video list.
///
/// @param spa_offset receives the offset of the physical address within the whole EDID; may be null.
bool encode_hdmi_vendor_block(const site_t &site, edid_t *edid, byte_writer_t *extension, u8 *spa_offset);

}  // namespace edid_composer

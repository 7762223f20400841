// Decoding of the HDMI vendor-specific data block (HDMI 1.4a, section 8.3.2).
#pragma once

#include "bytes.h"

namespace edid_composer {

/// Decodes the block whose header byte is the first of @p vendor_block. The view may reach past the block.
bool _decode_edid_vendor_block(const byte_view_t &vendor_block, edid_t *edid);

}  // namespace edid_composer

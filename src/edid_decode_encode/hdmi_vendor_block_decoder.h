// Decoding of the HDMI vendor-specific data block (HDMI 1.4a, section 8.3.2).
#pragma once

#include "bytes.h"
#include "linked_list/typed_list.h"

namespace edid_composer {

/// Decodes the block whose header byte is the first of @p vendor_block; the view may reach past the block. @p modes
/// appends to the record's short video descriptors, which receive the block's 3D structures. False, with a report, when
/// the block is malformed.
bool _decode_edid_vendor_block(const byte_view_t &vendor_block, const appender_t<short_video_desc_t> &modes,
                               edid_t *edid);

}  // namespace edid_composer

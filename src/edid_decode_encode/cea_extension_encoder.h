// Encoding of the CEA-861 extension (CEA-861, section 7.5).
#pragma once

#include "edid_decode_encode/encoder.h"

namespace edid_composer {

/// Writes the 128 bytes of @p extension, which hold 0, and fills @p encoding.
///
/// @param edid changed where the descriptors order it: 3D masks, extended audio types.
/// @param native_bit whether native video descriptors and the first one are marked.
/// @return false when a descriptor can't be encoded.
bool encode_cea_extension(edid_t *edid, bool native_bit, u8 *extension, encoding_t *encoding);

}  // namespace edid_composer

// Encoding of a whole EDID.
#pragma once

#include "edid_decode_encode/cea_extension_encoder.h"

namespace edid_composer {

/// encode_edid(), in whose name it reports, which also tells how much the extension needed when it succeeds.
u8 encode_and_measure_edid(u8 *edid_blocks, i32 size, edid_t *edid, u8 *spa_offset, const platform_values_t *values,
                           extension_size_t *extension_size);

}  // namespace edid_composer

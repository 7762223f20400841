// Encoding of an EDID with the data blocks of HDMI 2.
#pragma once

#include "edid_decode_encode/encoder.h"

namespace edid_composer {

/// As encode(), of a record that fits: its modes include those above VIC 64, and @p blocks has what edid_t has no
/// members for. Count and checksum of the base block always stand at its end.
encoding_t encode_with_hdmi2(u8 *edid_blocks, i32 size, edid_t *edid, const hdmi2_t &blocks,
                             const platform_values_t &values);

}  // namespace edid_composer

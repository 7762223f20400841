// The checksum of an EDID block (EDID 1.3, section 3).
#pragma once

#include "edid_decode_encode/layout.h"

namespace edid_composer {

inline constexpr u32 checksum_offset = 127;

/// The byte that makes the 128 bytes of @p block sum to 0 mod 256.
u8 _calculate_checksum(const byte_view_t &block);

}  // namespace edid_composer

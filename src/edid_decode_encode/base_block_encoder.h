// Encoding of the base block (EDID 1.3, section 3).
#pragma once

#include "edid_composer.h"

namespace edid_composer {

/// Writes the 128 bytes of @p block, which hold 0. False when there are no two detailed timings or they can't be
/// encoded.
bool encode_base_block(const edid_t &edid, u8 *block);

/// The number of detailed timings in the base block.
inline constexpr i32 base_block_timings = 2;

}  // namespace edid_composer

// Encoding of the base block (EDID 1.3, section 3).
#pragma once

#include "bytes.h"

namespace edid_composer {

/// Writes the 128 bytes of @p block, which hold 0. False when there are no two detailed timings or they can't be
/// encoded.
bool encode_base_block(const edid_t &edid, u8 *block);

// Its parts, for who arranges the descriptors otherwise.

/// Writes what stands before the display descriptors; @p writer is that of @p block. False as above.
bool encode_up_to_timings(const edid_t &edid, u8 *block, byte_writer_t *writer);
/// Puts the range limits (EDID 1.3, section 3.10.3), when all five are known.
void encode_range_limits(const edid_t &edid, byte_writer_t *block);

/// The number of detailed timings in the base block.
inline constexpr i32 base_block_timings = 2;

}  // namespace edid_composer

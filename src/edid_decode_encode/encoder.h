// Encoding of a whole EDID.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

/// What an encoding returns beside the bytes. The sizes count what was needed, also where that was more than there is.
struct encoding_t {
  bool complete = false;           ///< False: a list or descriptor stopped it.
  u8 physical_address_offset = 0;  ///< Within the whole EDID; set as soon as the HDMI block is begun.
  u32 extension_bytes = 0;         ///< Of the extension, before the checksum.
  u32 longest_block = 0;           ///< Of the data blocks that can become too long, without its header.
  bool text_left_out = false;      ///< The serial number text was left out for lack of room.
};

/// encode_edid(), in whose name it reports.
encoding_t encode(u8 *edid_blocks, i32 size, edid_t *edid, const platform_values_t *values);

/// The first step of that: fills the blocks with 0. False, reported, for arguments that can't be encoded.
bool clear_for_encoding(u8 *edid_blocks, i32 size, const edid_t *edid, const platform_values_t *values);

}  // namespace edid_composer

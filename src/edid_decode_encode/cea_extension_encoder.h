// Encoding of the CEA-861 extension (CEA-861, section 7.5).
#pragma once

#include "diagnostics.h"

namespace edid_composer {

/// What the extension needed, in bytes, also where that was more than there is.
struct extension_size_t {
  u32 bytes;          ///< Before the checksum.
  u32 longest_block;  ///< Of the data blocks, without its header.
};

/// Writes the 128 bytes of @p extension, which hold 0, in the name of @p site.
///
/// @param edid changed where the descriptors order it: 3D masks, extended audio types.
/// @param native_bit whether native video descriptors and the first one are marked.
/// @param timings_written number of detailed timings in the base block.
/// @param spa_offset receives the offset of the physical address within the whole EDID; may be null.
/// @param size complete only when all succeeded.
bool encode_cea_extension(const site_t &site, edid_t *edid, bool native_bit, u32 timings_written, u8 *extension,
                          u8 *spa_offset, extension_size_t *size);

}  // namespace edid_composer

// Decoding of a whole block, with the reason where it ends early. List entries come from the heap without an arena.
#pragma once

#include "edid_decode_encode/cea_extension_layout.h"
#include "linked_list/entry_arena.h"

namespace edid_composer {

/// decode_edid_block_0(), in whose name it reports, for pointers that are not null.
compose_sink_status decode_base_block(const u8 *edid_block, edid_t *edid, entry_arena_t *arena);

/// What became of an extension.
struct extension_outcome_t {
  compose_extension_status status;
  u32 malformed_at;  ///< Byte of the block at which the data block that overruns begins; else 0.
};

/// Whether the extension can be read, or why not. Says nothing of its data blocks, and prints nothing.
compose_extension_status status_of_extension(const byte_view_t &extension, u32 largest_timings_offset);

/// decode_edid_extensions(), in whose name it reports, for pointers that are not null.
extension_outcome_t decode_cea_extension(const u8 *edid_extension, u32 length, edid_t *edid, entry_arena_t *arena,
                                         u32 largest_timings_offset = cea_extension::largest_timings_offset);

}  // namespace edid_composer

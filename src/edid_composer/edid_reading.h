// Reading of a whole EDID as a composition does it: dumped block by block, then decoded.
#pragma once

#include "linked_list/entry_arena.h"

namespace edid_composer {

/// What became of the sink's EDID; the members as in compose_result_t.
struct sink_reading_t {
  compose_sink_status status;
  compose_extension_status extension_status = COMPOSE_EXTENSION_NOT_LOOKED_AT;
  u32 malformed_at = 0;
  u32 blocks_unread = 0;
};

/// Decodes the sink's EDID into a prepared record, as far as it can be read.
sink_reading_t read_sink(const u8 *sink_bytes, u32 size, edid_t *sink, entry_arena_t *arena);

/// As read_sink(), for a composition with HDMI 2: the first CTA-861 extension that can be read goes into @p sink, what
/// all of them say of HDMI 2 into @p hdmi2, which holds 0 but for its size.
sink_reading_t read_sink_with_hdmi2(const u8 *sink_bytes, u32 size, edid_t *sink, hdmi2_t *hdmi2, entry_arena_t *arena);

/// While tracing is on, decodes the 256 bytes of the new EDID again: what the decoders trace of it is the point.
void trace_new_edid(const u8 *new_edid);

/// While tracing is on, prints @p blocks blocks of 128 bytes in hexadecimal, 16 to a line.
void _dump_raw_edid_block(const u8 *bytes, i32 blocks);

}  // namespace edid_composer

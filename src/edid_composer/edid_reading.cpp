#include "edid_composer/edid_reading.h"

#include <algorithm>

#include "diagnostics.h"
#include "edid_decode_encode/decoder.h"
#include "edid_decode_encode/layout.h"
#include "output.h"

namespace edid_composer {

REPORTS_AS(compose_edid_internal);

sink_reading_t read_sink(const u8 *sink_bytes, u32 size, edid_t *sink, entry_arena_t *arena) {
  LOG_TRACE("Decode EDID Block %d", 0);
  _dump_raw_edid_block(sink_bytes, 1);
  sink_reading_t reading{.status = decode_base_block(sink_bytes, sink, arena)};
  if (reading.status != COMPOSE_SINK_READ) {
    LOG_ERROR("Failed decoding the edid block 0. Continuing.");
    return reading;
  }
  reading.extension_status = COMPOSE_EXTENSION_NOT_ANNOUNCED;
  if (sink->extension_count == 0) return reading;

  // A sink may announce an extension that it doesn't have.
  const u32 length = size - block_size;
  const u8 *const extension = sink_bytes + block_size;
  LOG_TRACE("Decode EDID Block 1");
  _dump_raw_edid_block(extension, length >= block_size ? 1 : 0);
  const extension_outcome_t outcome = decode_cea_extension(extension, length, sink, arena);
  if (outcome.status != COMPOSE_EXTENSION_READ) LOG_ERROR("Failed decoding the extension. Continuing.");
  reading.extension_status = length == 0 ? COMPOSE_EXTENSION_MISSING : outcome.status;
  reading.malformed_at = outcome.malformed_at;
  const u32 extensions = std::min<u32>(sink->extension_count, length / block_size);
  reading.blocks_unread = std::max<u32>(extensions, 1) - 1;
  return reading;
}

void trace_new_edid(const u8 *new_edid) {
  if (!is_tracing()) return;
  log_trace(site, __LINE__, "New EDID...");
  _dump_raw_edid_block(new_edid, 2);
  edid_t edid{};
  edid_prepare(&edid);
  if (decode_edid_block_0(new_edid, &edid) != 1) {
    LOG_WARNING("Failed decoding the new edid block 0.");
  } else if (decode_edid_extensions(new_edid + block_size, block_size, &edid) != 1) {
    LOG_WARNING("Failed decoding the new edid extension.");
  }
  edid_destroy(&edid);
}

void _dump_raw_edid_block(const u8 *bytes, i32 blocks) {
  constexpr u32 bytes_per_line = 16;
  if (!is_tracing()) return;
  for (i32 block = 0; block < blocks; ++block) {
    if (block > 0) print("\n");
    for (u32 i = 0; i < block_size; ++i) {
      print("%02X ", *bytes++);
      if (i % bytes_per_line == bytes_per_line - 1) print("\n");
    }
  }
}

}  // namespace edid_composer

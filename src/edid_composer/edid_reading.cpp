#include "edid_composer/edid_reading.h"

#include <algorithm>

#include "diagnostics.h"
#include "edid_composer/hdmi2/codec/cta_extensions.h"
#include "edid_composer/hdmi2/codec/sink_reader.h"
#include "edid_decode_encode/checksum.h"
#include "edid_decode_encode/decoder.h"
#include "edid_decode_encode/layout.h"
#include "output.h"

namespace edid_composer {

REPORTS_AS(compose_edid_internal);

namespace {

/// Begins a reading: without an extension so far.
sink_reading_t read_base_block(const u8 *sink_bytes, edid_t *sink, entry_arena_t *arena) {
  LOG_TRACE("Decode EDID Block %d", 0);
  _dump_raw_edid_block(sink_bytes, 1);
  sink_reading_t reading{.status = decode_base_block(sink_bytes, sink, arena)};
  if (reading.status != COMPOSE_SINK_READ) {
    LOG_ERROR("Failed decoding the edid block 0. Continuing.");
  } else {
    reading.extension_status = COMPOSE_EXTENSION_NOT_ANNOUNCED;
  }
  return reading;
}

/// Goes on with one extension.
void read_extension(const u8 *bytes, u32 length, u32 largest_timings_offset, edid_t *sink, entry_arena_t *arena,
                    sink_reading_t *reading) {
  const extension_outcome_t outcome = decode_cea_extension(bytes, length, sink, arena, largest_timings_offset);
  if (outcome.status != COMPOSE_EXTENSION_READ) LOG_ERROR("Failed decoding the extension. Continuing.");
  reading->extension_status = outcome.status;
  reading->malformed_at = outcome.malformed_at;
}

}  // namespace

sink_reading_t read_sink(const u8 *sink_bytes, u32 size, edid_t *sink, entry_arena_t *arena) {
  sink_reading_t reading = read_base_block(sink_bytes, sink, arena);
  if (reading.status != COMPOSE_SINK_READ || sink->extension_count == 0) return reading;

  // A sink may announce an extension that it doesn't have.
  const u32 length = size - block_size;
  const u8 *const extension = sink_bytes + block_size;
  LOG_TRACE("Decode EDID Block 1");
  _dump_raw_edid_block(extension, length >= block_size ? 1 : 0);
  read_extension(extension, length, cea_extension::largest_timings_offset, sink, arena, &reading);
  if (length == 0) reading.extension_status = COMPOSE_EXTENSION_MISSING;
  const u32 extensions = std::min<u32>(sink->extension_count, length / block_size);
  reading.blocks_unread = std::max<u32>(extensions, 1) - 1;
  return reading;
}

sink_reading_t read_sink_with_hdmi2(const u8 *sink_bytes, u32 size, edid_t *sink, hdmi2_t *hdmi2,
                                    entry_arena_t *arena) {
  sink_reading_t reading = read_base_block(sink_bytes, sink, arena);
  if (reading.status != COMPOSE_SINK_READ || sink->extension_count == 0) return reading;

  const byte_view_t edid(sink_bytes, size);
  const u32 extensions = std::min<u32>(sink->extension_count, size / block_size - 1);
  cta_extensions_t readable(edid);
  u32 readable_count = 0;
  while (readable.next())
    ++readable_count;
  reading.blocks_unread = extensions - readable_count;
  if (readable_count == 0) {
    LOG_WARNING("The sink has no CTA-861 extension of revision 3 that can be read. Announced:%u There:%u",
                sink->extension_count, extensions);
    sink->extension_count = 0;
    reading.extension_status = extensions == 0
                                   ? COMPOSE_EXTENSION_MISSING
                                   : status_of_extension(edid.from(block_size).first(block_size), checksum_offset);
    return reading;
  }
  const u32 block = first_cta_extension(edid);
  const byte_view_t extension = edid.from(block * block_size).first(block_size);
  LOG_TRACE("Decode EDID Block %u", block);
  _dump_raw_edid_block(extension.data(), 1);
  read_extension(extension.data(), extension.size(), checksum_offset, sink, arena, &reading);
  read_hdmi2(edid, hdmi2);
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

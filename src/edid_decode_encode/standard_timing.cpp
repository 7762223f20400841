#include "edid_decode_encode/standard_timing.h"

namespace edid_composer {
namespace {

constexpr u8 unused = 0x01;
constexpr u32 h_active_unit = 8;
constexpr u32 h_active_base = 31;
constexpr u32 aspect_shift = 6;
constexpr u8 refresh_mask = 0x3F;
constexpr u32 refresh_base = 60;

}  // namespace

appender_t<std_timing_t> standard_timing_appender(edid_t *edid, entry_arena_t *arena) {
  REPORTS_AS(_decode_edid_standard_timing);
  return appender_t<std_timing_t>(&edid->std_timings, arena, site);
}

bool _decode_edid_standard_timing(u8 byte_a, u8 byte_b, appender_t<std_timing_t> *timings) {
  if (byte_a == unused && byte_b == unused) return true;
  return timings->append({
      .h_active = (byte_a + h_active_base) * h_active_unit,
      .aspect_ratio = static_cast<u32>(byte_b) >> aspect_shift,
      .refresh_rate = (byte_b & refresh_mask) + refresh_base,
  });
}

void put_standard_timing(byte_writer_t *block, const std_timing_t &timing) {
  block->put(low_byte(timing.h_active / h_active_unit - h_active_base));
  block->put(low_byte((timing.refresh_rate - refresh_base) | timing.aspect_ratio << aspect_shift));
}

void put_unused_standard_timing(byte_writer_t *block) {
  block->put(unused);
  block->put(unused);
}

}  // namespace edid_composer

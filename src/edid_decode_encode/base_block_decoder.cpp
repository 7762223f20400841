#include "diagnostics.h"
#include "edid_decode_encode/base_block_layout.h"
#include "edid_decode_encode/checksum.h"
#include "edid_decode_encode/decoder.h"
#include "edid_decode_encode/descriptor.h"
#include "edid_decode_encode/descriptor_layout.h"
#include "edid_decode_encode/record_lists.h"
#include "edid_decode_encode/standard_timing.h"

namespace edid_composer {
namespace {

REPORTS_AS(decode_edid_block_0);

using u64 = unsigned long long;

bool is_prepared(const edid_t &edid) {
  for (const auto &row : record_lists) {
    if (!ll_is_initialized(&(edid.*row.list))) {
      LOG_ERROR("%s: List not initialized.", row.name);
      return false;
    }
  }
  return true;
}

bool verify_header(const byte_view_t &block) {
  const auto little_endian_64 = [](const byte_view_t &bytes) {
    return u64{bytes.little_endian_32(4)} << 32 | bytes.little_endian_32(0);
  };
  const u64 expected = little_endian_64({base_block::header, sizeof base_block::header});
  const u64 received = little_endian_64(block);
  if (received == expected) return true;
  LOG_ERROR("Failed verifying the header. Expected:%16llx Received:%16llx", expected, received);
  return false;
}

bool verify_checksum(const byte_view_t &block) {
  const u8 calculated = _calculate_checksum(block);
  if (calculated == block[checksum_offset]) return true;
  LOG_ERROR("Edid failed the checksum. Calculated:0x%02X Received:0x%02X", calculated, block[checksum_offset]);
  return false;
}

void decode_identity(const byte_view_t &block, edid_t *edid) {
  const u32 manufacturer = block.big_endian_16(base_block::manufacturer);
  for (u32 i = 0; i < 3; ++i) {
    const u32 letter = manufacturer >> base_block::letter_shifts[i] & base_block::letter_mask;
    edid->manufacturer[i] = static_cast<char>(base_block::letter_base + letter);
  }
  edid->manufacturer[3] = '\0';
  edid->product_code = block.little_endian_16(base_block::product_code);
  edid->serial_number = block.little_endian_32(base_block::serial_number);
  edid->week = block[base_block::week];
  edid->year = block[base_block::year] + base_block::year_base;
  edid->version = block[base_block::version];
  edid->revision = block[base_block::revision];
}

bool verify_version(const edid_t &edid) {
  if (base_block::is_supported(edid.version, edid.revision)) return true;
  LOG_ERROR("Failed EDID Version/Revision check. Expected:%d.%d Recieved:%d.%d", base_block::supported_version,
            base_block::least_revision, edid.version, edid.revision);
  return false;
}

void decode_features(const byte_view_t &block, edid_t *edid) {
  edid->h_size_cm = block[base_block::h_size_cm];
  edid->v_size_cm = block[base_block::v_size_cm];
  edid->gamma = block[base_block::gamma];
  decode_flags(base_block::feature_flags, block[base_block::features], edid);
  decode_split_fields(base_block::chromaticity_fields, block, edid);
  edid->est_timings_1 = block[base_block::est_timings_1];
  edid->est_timings_2 = block[base_block::est_timings_2];
  edid->man_timings = block[base_block::man_timings];
}

bool decode_standard_timings(const byte_view_t &block, edid_t *edid, entry_arena_t *arena) {
  appender_t<std_timing_t> timings = standard_timing_appender(edid, arena);
  for (u32 i = 0; i < base_block::standard_timing_count; ++i) {
    const u8 byte_a = block[base_block::standard_timings + 2 * i];
    const u8 byte_b = block[base_block::standard_timings + 2 * i + 1];
    if (!_decode_edid_standard_timing(byte_a, byte_b, &timings)) {
      LOG_ERROR("Failed decoding #%d standard timing. Val1:0x%x Val2:0x%x", i + 1, byte_a, byte_b);
      return false;
    }
  }
  return true;
}

compose_sink_status decode_descriptors(const byte_view_t &block, edid_t *edid, entry_arena_t *arena) {
  appender_t<detailed_timing_t> timings = detailed_timing_appender(edid, arena);
  for (u32 i = 0; i < base_block::descriptor_count; ++i) {
    const byte_view_t d = block.from(base_block::descriptors + i * descriptor_size);
    if (_decode_edid_dtd(d, &timings, edid)) continue;
    // kept: counted from 0, unlike the standard timings.
    LOG_ERROR(
        "Failed decoding #%d DTD. 0x%x 0x%x 0x%x 0x%x 0x%x 0x%x 0x%x 0x%x 0x%x 0x%x 0x%x 0x%x 0x%x 0x%x 0x%x 0x%x "
        "0x%x 0x%x",
        i, d[0], d[1], d[2], d[3], d[4], d[5], d[6], d[7], d[8], d[9], d[10], d[11], d[12], d[13], d[14], d[15], d[16],
        d[17]);
    // A timing is refused only where it can't be kept.
    return is_display_descriptor(d) ? COMPOSE_SINK_DESCRIPTOR_INVALID : COMPOSE_SINK_OUT_OF_MEMORY;
  }
  return COMPOSE_SINK_READ;
}

}  // namespace

compose_sink_status decode_base_block(const u8 *edid_block, edid_t *edid, entry_arena_t *arena) {
  if (!is_prepared(*edid)) return COMPOSE_SINK_OUT_OF_MEMORY;
  const byte_view_t block(edid_block, block_size);
  if (!verify_header(block)) return COMPOSE_SINK_HEADER_INVALID;
  edid->valid = 1;
  edid->checksum = block[checksum_offset];
  if (!verify_checksum(block)) return COMPOSE_SINK_CHECKSUM_INVALID;
  decode_identity(block, edid);
  if (!verify_version(*edid)) return COMPOSE_SINK_VERSION_UNSUPPORTED;
  edid->digital = (block[base_block::video_input] & base_block::digital_input) != 0;
  if (edid->digital == 0) LOG_WARNING("EDID inappropriately set to analog. Continuing.");
  decode_features(block, edid);
  if (!decode_standard_timings(block, edid, arena)) return COMPOSE_SINK_OUT_OF_MEMORY;
  const compose_sink_status status = decode_descriptors(block, edid, arena);
  if (status == COMPOSE_SINK_READ) edid->extension_count = block[base_block::extension_count];
  return status;
}

}  // namespace edid_composer

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operation below is the namespace's API

u8 decode_edid_block_0(const u8 *edid_block, edid_t *edid) {
  if (edid_block == nullptr) {
    LOG_ERROR("Function called with edid_block set to NULL.");
    return 0;
  }
  if (edid == nullptr) {
    LOG_ERROR("Function called with edid set to NULL.");
    return 0;
  }
  return decode_base_block(edid_block, edid, nullptr) == COMPOSE_SINK_READ ? 1 : 0;
}

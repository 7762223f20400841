// Decoding of what a whole EDID says of HDMI 2: what the caller gave is checked, then read.
#include <cstring>

#include "edid_composer/hdmi2/codec/hdmi2_record.h"
#include "edid_composer/hdmi2/codec/sink_reader.h"
#include "edid_decode_encode/base_block_layout.h"
#include "edid_decode_encode/checksum.h"

namespace edid_composer {
namespace {

REPORTS_AS(decode_hdmi2);

bool verify_size(u32 edid_bytes) {
  if (edid_bytes != 0 && edid_bytes % block_size == 0) return true;
  LOG_ERROR("The size of the EDID is not a multiple of %u bytes. Received:%u", block_size, edid_bytes);
  return false;
}

bool verify_base_block(const byte_view_t &block) {
  if (std::memcmp(block.data(), base_block::header, sizeof base_block::header) != 0) {
    LOG_ERROR(
        "The base block does not begin with the header of an EDID. Expected:0x00FFFFFFFFFFFF00 "
        "Received:0x%04X%04X%04X%04X",
        block.big_endian_16(0), block.big_endian_16(2), block.big_endian_16(4), block.big_endian_16(6));
    return false;
  }
  const u8 calculated = _calculate_checksum(block);
  if (calculated != block[checksum_offset]) {
    LOG_ERROR("The base block failed the checksum. Calculated:0x%02X Received:0x%02X", calculated,
              block[checksum_offset]);
    return false;
  }
  const u8 version = block[base_block::version];
  const u8 revision = block[base_block::revision];
  if (base_block::is_supported(version, revision)) return true;
  LOG_ERROR("The base block is of another version. Expected:%u.%u Received:%u.%u", base_block::supported_version,
            base_block::least_revision, version, revision);
  return false;
}

}  // namespace
}  // namespace edid_composer

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operation below is the namespace's API

bool decode_hdmi2(const u8 *edid, u32 edid_bytes, hdmi2_t *hdmi2) {
  if (!is_record(site, hdmi2)) return false;
  std::memset(hdmi2, 0, sizeof *hdmi2);
  hdmi2->size = sizeof *hdmi2;
  if (edid == nullptr) {
    LOG_ERROR("Function called with edid set to NULL.");
    return false;
  }
  const byte_view_t bytes(edid, edid_bytes);
  if (!verify_size(edid_bytes) || !verify_base_block(bytes.first(block_size))) return false;
  read_hdmi2(bytes, hdmi2);
  return true;
}

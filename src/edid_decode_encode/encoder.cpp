#include "edid_decode_encode/encoder.h"

#include <cstring>

#include "diagnostics.h"
#include "edid_decode_encode/base_block_encoder.h"
#include "edid_decode_encode/cea_extension_encoder.h"
#include "edid_decode_encode/layout.h"

namespace edid_composer {

namespace {

constexpr i32 edid_size = 2 * block_size;

}  // namespace

bool clear_for_encoding(u8 *edid_blocks, i32 size, const edid_t *edid, const platform_values_t *values) {
  REPORTS_AS(encode_edid);
  if (edid_blocks == nullptr) {
    LOG_ERROR("Function called with edid_blocks set to NULL.");
  } else if (edid == nullptr) {
    LOG_ERROR("Function called with edid set to NULL.");
  } else if (values == nullptr) {
    LOG_ERROR("Function called with values set to NULL.");
  } else if (size != edid_size) {
    LOG_ERROR("Function called with an unsupported block size. val:%d expected:%d", size, edid_size);
  } else {
    std::memset(edid_blocks, 0, edid_size);
    return true;
  }
  return false;
}

encoding_t encode(u8 *edid_blocks, i32 size, edid_t *edid, const platform_values_t *values) {
  encoding_t encoding;
  encoding.complete = clear_for_encoding(edid_blocks, size, edid, values) && encode_base_block(*edid, edid_blocks) &&
                      encode_cea_extension(edid, values->native_bit != 0, edid_blocks + block_size, &encoding);
  return encoding;
}

}  // namespace edid_composer

u8 encode_edid(u8 *edid_blocks, i32 size, edid_t *edid, u8 *spa_offset, const platform_values_t *values) {
  const edid_composer::encoding_t encoding = edid_composer::encode(edid_blocks, size, edid, values);
  if (spa_offset != nullptr && encoding.physical_address_offset != 0) *spa_offset = encoding.physical_address_offset;
  return encoding.complete ? 1 : 0;
}

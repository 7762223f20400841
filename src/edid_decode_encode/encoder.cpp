#include "edid_decode_encode/encoder.h"

#include <cstring>

#include "diagnostics.h"
#include "edid_decode_encode/base_block_encoder.h"
#include "edid_decode_encode/checksum.h"

namespace edid_composer {

u8 encode_and_measure_edid(u8 *edid_blocks, i32 size, edid_t *edid, u8 *spa_offset, const platform_values_t *values,
                           extension_size_t *extension_size) {
  constexpr i32 edid_size = 2 * block_size;
  const site_t site{EDID_COMPOSER_MODULE, "encode_edid", __LINE__};
  if (edid_blocks == nullptr) {
    LOG_ERROR_AS(site, "Function called with edid_blocks set to NULL.");
    return 0;
  }
  if (edid == nullptr) {
    LOG_ERROR_AS(site, "Function called with edid set to NULL.");
    return 0;
  }
  if (values == nullptr) {
    LOG_ERROR_AS(site, "Function called with values set to NULL.");
    return 0;
  }
  if (size != edid_size) {
    LOG_ERROR_AS(site, "Function called with an unsupported block size. val:%d expected:%d", size, edid_size);
    return 0;
  }
  std::memset(edid_blocks, 0, edid_size);
  const base_block_result_t base = encode_base_block(site, *edid, edid_blocks);
  if (!base.complete) return 0;
  if (!encode_cea_extension(site, edid, values->native_bit != 0, base.timings_written, edid_blocks + block_size,
                            spa_offset, extension_size)) {
    return 0;
  }
  return base.all_found ? 1 : 0;
}

}  // namespace edid_composer

u8 encode_edid(u8 *edid_blocks, i32 size, edid_t *edid, u8 *spa_offset, const platform_values_t *values) {
  edid_composer::extension_size_t unasked;
  return edid_composer::encode_and_measure_edid(edid_blocks, size, edid, spa_offset, values, &unasked);
}

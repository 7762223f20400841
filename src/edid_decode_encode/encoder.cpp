#include <cstring>

#include "diagnostics.h"
#include "edid_decode_encode/base_block_encoder.h"
#include "edid_decode_encode/cea_extension_encoder.h"
#include "edid_decode_encode/checksum.h"

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operation below is the namespace's API

u8 encode_edid(u8 *edid_blocks, i32 size, edid_t *edid, u8 *spa_offset, const platform_values_t *values) {
  constexpr i32 edid_size = 2 * block_size;
  if (edid_blocks == nullptr) {
    LOG_ERROR("Function called with edid_blocks set to NULL.");
    return 0;
  }
  if (edid == nullptr) {
    LOG_ERROR("Function called with edid set to NULL.");
    return 0;
  }
  if (values == nullptr) {
    LOG_ERROR("Function called with values set to NULL.");
    return 0;
  }
  if (size != edid_size) {
    LOG_ERROR("Function called with an unsupported block size. val:%d expected:%d", size, edid_size);
    return 0;
  }
  std::memset(edid_blocks, 0, edid_size);
  const base_block_result_t base = encode_base_block(HERE, *edid, edid_blocks);
  if (!base.complete) return 0;
  if (!encode_cea_extension(HERE, edid, values->native_bit != 0, base.timings_written, edid_blocks + block_size,
                            spa_offset)) {
    return 0;
  }
  return base.all_found ? 1 : 0;
}

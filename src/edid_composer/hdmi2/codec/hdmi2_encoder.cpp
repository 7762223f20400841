// Encoding of a record as data blocks.
#include "edid_composer/hdmi2/codec/hdmi2_blocks.h"
#include "edid_composer/hdmi2/codec/hdmi2_record.h"
#include "edid_composer/hdmi2/codec/short_video_descriptors.h"

namespace edid_composer {

REPORTS_AS(encode_hdmi2);

}

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operation below is the namespace's API

bool encode_hdmi2(const hdmi2_t *hdmi2, u8 *blocks, u32 size, u32 *used) {
  if (!is_record(site, hdmi2)) return false;
  if (blocks == nullptr) {
    LOG_ERROR("Function called with blocks set to NULL.");
    return false;
  }
  if (used == nullptr) {
    LOG_ERROR("Function called with used set to NULL.");
    return false;
  }
  *used = video_blocks_size(*hdmi2) + hdmi2_blocks_size(*hdmi2);
  if (*used > size) {
    LOG_ERROR("The data blocks have too little room. Needed:%u Received:%u", *used, size);
    return false;
  }
  byte_writer_t writer(blocks, size);
  write_video_blocks(*hdmi2, &writer);
  write_hdmi2_blocks(*hdmi2, &writer);
  return true;
}

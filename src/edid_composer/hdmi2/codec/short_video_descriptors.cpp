#include "edid_composer/hdmi2/codec/short_video_descriptors.h"

#include <algorithm>

namespace edid_composer {
namespace {

constexpr u32 most_in_a_block = HDMI2_MOST_BLOCK_BYTES;

u32 svd_count(const hdmi2_t &hdmi2) {
  return std::min<u32>(hdmi2.svd_count, HDMI2_MOST_SVDS);
}

}  // namespace

bool is_marked_420(const hdmi2_t &hdmi2, u32 index) {
  if (hdmi2.y420_map_present == 0 || index >= hdmi2.svd_count) return false;
  if (hdmi2.y420_map_bytes == 0) return true;
  const byte_view_t map = byte_view_t(hdmi2.y420_map, sizeof hdmi2.y420_map).first(hdmi2.y420_map_bytes);
  return (map[index / 8] >> index % 8 & 1) != 0;
}

void read_video_block(const byte_view_t &block, hdmi2_t *hdmi2) {
  const byte_view_t codes = block.from(1).first(HDMI2_MOST_SVDS - hdmi2->svd_count);
  codes.copy(0, hdmi2->svds + hdmi2->svd_count, codes.size());
  hdmi2->svd_count += codes.size();
}

u32 video_blocks_size(const hdmi2_t &hdmi2) {
  const u32 count = svd_count(hdmi2);
  return count + (count + most_in_a_block - 1) / most_in_a_block;
}

void write_video_blocks(const hdmi2_t &hdmi2, byte_writer_t *blocks) {
  const u32 count = svd_count(hdmi2);
  for (u32 i = 0; i < count; i += most_in_a_block) {
    const u32 codes = std::min(count - i, most_in_a_block);
    blocks->put(data_block::header(data_block::video, codes));
    blocks->put(hdmi2.svds + i, codes);
  }
}

}  // namespace edid_composer

#include "edid_composer/hdmi2/codec/hdmi2_blocks.h"

namespace edid_composer {

u32 hdmi2_blocks_size(const hdmi2_t &hdmi2) {
  u32 size = 0;
  for (const block_codec_t *const codec : hdmi2_blocks)
    size += size_of_block(*codec, hdmi2);
  return size;
}

void write_hdmi2_blocks(const hdmi2_t &hdmi2, byte_writer_t *blocks) {
  for (const block_codec_t *const codec : hdmi2_blocks)
    write_block(*codec, hdmi2, blocks);
}

}  // namespace edid_composer

#include "edid_composer/hdmi2/codec/data_block_codec.h"

#include <cstring>

namespace edid_composer {

bool is_block(const block_identity_t &identity, const byte_view_t &block) {
  if (block[0] >> data_block::tag_shift != identity.tag) return false;
  if (block.size() <= identity.identifier_size) return false;
  return std::memcmp(block.data() + 1, identity.identifier, identity.identifier_size) == 0;
}

u32 size_of_block(const block_codec_t &codec, const hdmi2_t &hdmi2) {
  const u32 payload = codec.payload(hdmi2);
  return payload != 0 ? 1 + payload : 0;
}

void write_block(const block_codec_t &codec, const hdmi2_t &hdmi2, byte_writer_t *blocks) {
  const u32 payload = codec.payload(hdmi2);
  if (payload == 0) return;
  blocks->put(data_block::header(codec.identity.tag, payload));
  blocks->put(codec.identity.identifier, codec.identity.identifier_size);
  codec.write(hdmi2, blocks);
}

}  // namespace edid_composer

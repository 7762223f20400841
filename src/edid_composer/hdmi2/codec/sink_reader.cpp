#include "edid_composer/hdmi2/codec/sink_reader.h"

#include <iterator>

#include "diagnostics.h"
#include "edid_composer/hdmi2/codec/cta_extensions.h"
#include "edid_composer/hdmi2/codec/hdmi2_blocks.h"
#include "edid_composer/hdmi2/codec/short_video_descriptors.h"
#include "edid_decode_encode/data_blocks.h"

namespace edid_composer {
namespace {

REPORTS_AS(decode_hdmi2);

/// Where a data block stands, for what is said of it.
struct place_t {
  u32 block;  ///< Of the EDID.
  u32 byte;   ///< Of that block.
};

/// Fills a record block by block; the first of each kind that is long enough counts.
class reader_t {
 public:
  explicit reader_t(hdmi2_t *hdmi2) : hdmi2_(hdmi2) {}

  void read(const byte_view_t &block, const place_t &place) {
    if (block[0] >> data_block::tag_shift == data_block::video) {
      read_video_block(block, hdmi2_);
      return;
    }
    for (u32 i = 0; i < std::size(hdmi2_blocks); ++i) {
      const block_codec_t &codec = *hdmi2_blocks[i];
      if (has_[i] || !is_block(codec.identity, block)) continue;
      has_[i] = is_long_enough(codec.identity, block, place);
      if (has_[i]) codec.read(block, hdmi2_);
    }
    // Only until a vendor-specific block comes, which takes its place.
    if (hdmi2_->forum_present == 0 && is_block(sink_capability_structure, block) &&
        is_long_enough(sink_capability_structure, block, place)) {
      hdmi_forum_block.read(block, hdmi2_);
    }
  }

 private:
  static bool is_long_enough(const block_identity_t &identity, const byte_view_t &block, const place_t &place) {
    const u32 payload = block.size() - 1;
    if (payload >= identity.least_payload) return true;
    LOG_WARNING("The %s is too short. Ignoring it. Expected at least:%u Received:%u Block:%u Byte:%u", identity.name,
                identity.least_payload, payload, place.block, place.byte);
    return false;
  }

  hdmi2_t *hdmi2_;
  bool has_[std::size(hdmi2_blocks)] = {};
};

void read_extension(const byte_view_t &extension, u32 block, reader_t *reader) {
  // An offset that points into the extension's header stands for no data blocks.
  if (extension[cea_extension::timings_offset] < cea_extension::data_blocks) return;
  data_blocks_t blocks(extension);
  while (blocks.next()) {
    reader->read(extension.from(blocks->offset).first(1 + blocks->length), {block, blocks->offset});
  }
  if (blocks.overruns()) {
    LOG_WARNING(
        "A data block crosses the end of the data blocks. Ignoring the rest of them. Tag:%u Len:%u Block:%u Byte:%u "
        "End:%u",
        blocks->tag, blocks->length, block, blocks->offset, cea_extension::data_blocks + blocks.size());
  }
}

/// Clears the bits that no descriptor belongs to: blocks that come after the map may hold some.
void bound_map(hdmi2_t *hdmi2) {
  u32 cleared = 0;
  for (u32 bit = hdmi2->svd_count; bit < hdmi2->y420_map_bytes * 8U; ++bit) {
    u8 &byte = hdmi2->y420_map[bit / 8];
    const u8 mask = static_cast<u8>(1U << bit % 8);
    cleared += bit_of(byte, mask);
    byte = static_cast<u8>(byte & ~mask);
  }
  if (cleared == 0) return;
  LOG_WARNING("The %s marks more than the short video descriptors. Ignoring the others. Descriptors:%u Others:%u",
              ycbcr_420_map_block.identity.name, hdmi2->svd_count, cleared);
}

}  // namespace

void read_hdmi2(const byte_view_t &edid, hdmi2_t *hdmi2) {
  reader_t reader(hdmi2);
  cta_extensions_t extensions(edid);
  while (extensions.next())
    read_extension(*extensions, extensions.block(), &reader);
  bound_map(hdmi2);
}

}  // namespace edid_composer

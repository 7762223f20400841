#include "edid_composer/hdmi2/codec/ycbcr_420_video_block.h"

#include <algorithm>
#include <iterator>

namespace edid_composer {
namespace {

constexpr u32 descriptors = 2;
constexpr u32 identifier_size = 1;
constexpr u32 most_descriptors = std::size(hdmi2_t{}.y420_vics);

void read(const byte_view_t &block, hdmi2_t *hdmi2) {
  hdmi2->y420_count = low_byte(block.size() - descriptors);
  block.copy(descriptors, hdmi2->y420_vics, hdmi2->y420_count);
}

u32 count(const hdmi2_t &hdmi2) {
  return std::min<u32>(hdmi2.y420_count, most_descriptors);
}

u32 payload(const hdmi2_t &hdmi2) {
  return hdmi2.y420_count != 0 ? identifier_size + count(hdmi2) : 0;
}

void write(const hdmi2_t &hdmi2, byte_writer_t *blocks) {
  blocks->put(hdmi2.y420_vics, count(hdmi2));
}

}  // namespace

constinit const block_codec_t ycbcr_420_video_block{
    .identity = {"YCbCr 4:2:0 video block", data_block::extended, {0x0E}, identifier_size, identifier_size + 1},
    .read = read,
    .payload = payload,
    .write = write,
};

}  // namespace edid_composer

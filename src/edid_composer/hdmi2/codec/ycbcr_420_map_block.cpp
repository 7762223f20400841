#include "edid_composer/hdmi2/codec/ycbcr_420_map_block.h"

#include <algorithm>
#include <iterator>

namespace edid_composer {
namespace {

constexpr u32 map = 2;
constexpr u32 identifier_size = 1;
constexpr u32 most_bytes = std::size(hdmi2_t{}.y420_map);

void read(const byte_view_t &block, hdmi2_t *hdmi2) {
  hdmi2->y420_map_present = 1;
  hdmi2->y420_map_bytes = low_byte(block.size() - map);
  block.copy(map, hdmi2->y420_map, hdmi2->y420_map_bytes);
}

u32 bytes(const hdmi2_t &hdmi2) {
  return std::min<u32>(hdmi2.y420_map_bytes, most_bytes);
}

u32 payload(const hdmi2_t &hdmi2) {
  return hdmi2.y420_map_present != 0 ? identifier_size + bytes(hdmi2) : 0;
}

void write(const hdmi2_t &hdmi2, byte_writer_t *blocks) {
  blocks->put(hdmi2.y420_map, bytes(hdmi2));
}

}  // namespace

constinit const block_codec_t ycbcr_420_map_block{
    .identity = {"YCbCr 4:2:0 capability map", data_block::extended, {0x0F}, identifier_size, identifier_size},
    .read = read,
    .payload = payload,
    .write = write,
};

}  // namespace edid_composer

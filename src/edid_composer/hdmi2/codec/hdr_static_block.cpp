#include "edid_composer/hdmi2/codec/hdr_static_block.h"

#include <algorithm>
#include <iterator>

namespace edid_composer {
namespace {

constexpr u32 eotfs = 2;
constexpr u32 metadata_types = 3;
constexpr u32 luminance = 4;
constexpr u32 least_payload = 3;
constexpr u32 most_luminance = std::size(hdmi2_t{}.luminance);

void read(const byte_view_t &block, hdmi2_t *hdmi2) {
  hdmi2->hdr_static_present = 1;
  hdmi2->eotfs = block[eotfs];
  hdmi2->metadata_types = block[metadata_types];
  hdmi2->luminance_count = low_byte(std::min(block.size() - luminance, most_luminance));
  block.copy(luminance, hdmi2->luminance, most_luminance);
}

u32 luminance_count(const hdmi2_t &hdmi2) {
  return std::min<u32>(hdmi2.luminance_count, most_luminance);
}

u32 payload(const hdmi2_t &hdmi2) {
  return hdmi2.hdr_static_present != 0 ? least_payload + luminance_count(hdmi2) : 0;
}

void write(const hdmi2_t &hdmi2, byte_writer_t *blocks) {
  blocks->put(hdmi2.eotfs);
  blocks->put(hdmi2.metadata_types);
  blocks->put(hdmi2.luminance, luminance_count(hdmi2));
}

}  // namespace

constinit const block_codec_t hdr_static_block{
    .identity = {"HDR static metadata block", data_block::extended, {0x06}, 1, least_payload},
    .read = read,
    .payload = payload,
    .write = write,
};

}  // namespace edid_composer

#include "edid_composer/hdmi2/codec/colorimetry_block.h"

namespace edid_composer {
namespace {

constexpr u32 color_spaces = 2;
constexpr u32 gamut_metadata = 3;
constexpr u32 payload_bytes = 3;

void read(const byte_view_t &block, hdmi2_t *hdmi2) {
  hdmi2->colorimetry_present = 1;
  hdmi2->colorimetry = block[color_spaces];
  hdmi2->gamut_metadata = block[gamut_metadata];
}

u32 payload(const hdmi2_t &hdmi2) {
  return hdmi2.colorimetry_present != 0 ? payload_bytes : 0;
}

void write(const hdmi2_t &hdmi2, byte_writer_t *blocks) {
  blocks->put(hdmi2.colorimetry);
  blocks->put(hdmi2.gamut_metadata);
}

}  // namespace

constinit const block_codec_t colorimetry_block{
    .identity = {"colorimetry block", data_block::extended, {0x05}, 1, payload_bytes},
    .read = read,
    .payload = payload,
    .write = write,
};

}  // namespace edid_composer

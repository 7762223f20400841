#include "edid_composer/hdmi2/codec/video_capability_block.h"

#include <algorithm>

namespace edid_composer {
namespace {

constexpr u32 capabilities = 2;
constexpr u32 payload_bytes = 2;

constexpr u8 ycc_quantization = 0x80;
constexpr u8 rgb_quantization = 0x40;

/// How overscan and underscan are handled: two bits for each kind of timing.
struct scan_field_t {
  u8 hdmi2_t::*member;
  u32 shift;
};
constexpr scan_field_t scan_fields[] = {
    {&hdmi2_t::preferred_scan, 4},
    {&hdmi2_t::it_scan, 2},
    {&hdmi2_t::ce_scan, 0},
};
constexpr u8 most_scan = 0x03;

void read(const byte_view_t &block, hdmi2_t *hdmi2) {
  const u8 byte = block[capabilities];
  hdmi2->video_capability_present = 1;
  hdmi2->ycc_quantization = bit_of(byte, ycc_quantization);
  hdmi2->rgb_quantization = bit_of(byte, rgb_quantization);
  for (const scan_field_t &field : scan_fields)
    hdmi2->*field.member = byte >> field.shift & most_scan;
}

u32 payload(const hdmi2_t &hdmi2) {
  return hdmi2.video_capability_present != 0 ? payload_bytes : 0;
}

void write(const hdmi2_t &hdmi2, byte_writer_t *blocks) {
  u32 byte = bit_if(hdmi2.ycc_quantization, ycc_quantization) | bit_if(hdmi2.rgb_quantization, rgb_quantization);
  for (const scan_field_t &field : scan_fields)
    byte |= u32{std::min(hdmi2.*field.member, most_scan)} << field.shift;
  blocks->put(low_byte(byte));
}

}  // namespace

constinit const block_codec_t video_capability_block{
    .identity = {"video capability block", data_block::extended, {0x00}, 1, payload_bytes},
    .read = read,
    .payload = payload,
    .write = write,
};

}  // namespace edid_composer

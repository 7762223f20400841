#include "edid_composer/hdmi2/codec/hdmi_forum_block.h"

#include <algorithm>

namespace edid_composer {
namespace {

constexpr u32 version = 4;
constexpr u32 max_tmds_rate = 5;
constexpr u32 link_flags = 6;
constexpr u32 video_flags = 7;
constexpr u32 allm_flags = 8;
constexpr u32 vrr_minimum = 9;
constexpr u32 vrr_maximum = 10;

/// MHz.
constexpr u32 tmds_rate_unit = 5;
constexpr u32 most_tmds_rate = 255 * tmds_rate_unit;

constexpr u32 frl_rate_shift = 4;
constexpr u32 most_frl_rate = 0x0F;
constexpr u8 allm = 0x02;

/// The maximum has its two highest bits above the minimum.
constexpr u32 vrr_minimum_mask = 0x3F;
constexpr u32 vrr_high_bits_mask = 0xC0;
constexpr u32 vrr_high_bits_shift = 2;
constexpr u32 most_vrr_maximum = 0x3FF;

/// Payload bytes of a block that ends with the video flags, with ALLM, with VRR.
constexpr u32 least_payload = 7;
constexpr u32 payload_with_allm = 8;
constexpr u32 payload_with_vrr = 10;

/// A boolean of the record and its place.
struct forum_flag_t {
  u8 hdmi2_t::*member;
  u8 mask;
};
constexpr forum_flag_t link_flag_bits[] = {
    {&hdmi2_t::scdc, 0x80},
    {&hdmi2_t::read_request, 0x40},
    {&hdmi2_t::scramble_low, 0x08},
};
constexpr forum_flag_t video_flag_bits[] = {
    {&hdmi2_t::uhd_vic, 0x08},
    {&hdmi2_t::dc_48bit_420, 0x04},
    {&hdmi2_t::dc_36bit_420, 0x02},
    {&hdmi2_t::dc_30bit_420, 0x01},
};

template <std::size_t count>
void read_flags(const forum_flag_t (&flags)[count], u8 byte, hdmi2_t *hdmi2) {
  for (const forum_flag_t &flag : flags)
    hdmi2->*flag.member = bit_of(byte, flag.mask);
}

template <std::size_t count>
u32 flag_bits(const forum_flag_t (&flags)[count], const hdmi2_t &hdmi2) {
  u32 byte = 0;
  for (const forum_flag_t &flag : flags)
    byte |= bit_if(hdmi2.*flag.member, flag.mask);
  return byte;
}

void read(const byte_view_t &block, hdmi2_t *hdmi2) {
  hdmi2->forum_present = 1;
  hdmi2->forum_version = block[version];
  hdmi2->max_tmds_rate = block[max_tmds_rate] * tmds_rate_unit;
  read_flags(link_flag_bits, block[link_flags], hdmi2);
  hdmi2->frl_rate = static_cast<u8>(block[video_flags] >> frl_rate_shift);
  read_flags(video_flag_bits, block[video_flags], hdmi2);
  hdmi2->allm_present = block.size() > payload_with_allm ? 1 : 0;
  hdmi2->allm = bit_of(block[allm_flags], allm);
  hdmi2->vrr_present = block.size() > payload_with_vrr ? 1 : 0;
  const bool has_vrr = hdmi2->vrr_present != 0;
  hdmi2->vrr_min = has_vrr ? block[vrr_minimum] & vrr_minimum_mask : 0;
  hdmi2->vrr_max = has_vrr ? (block[vrr_minimum] & vrr_high_bits_mask) << vrr_high_bits_shift | block[vrr_maximum] : 0;
}

u32 payload(const hdmi2_t &hdmi2) {
  if (hdmi2.forum_present == 0) return 0;
  if (hdmi2.vrr_present != 0) return payload_with_vrr;
  return hdmi2.allm_present != 0 ? payload_with_allm : least_payload;
}

void write(const hdmi2_t &hdmi2, byte_writer_t *blocks) {
  blocks->put(hdmi2.forum_version);
  blocks->put(low_byte(std::min(hdmi2.max_tmds_rate, most_tmds_rate) / tmds_rate_unit));
  blocks->put(low_byte(flag_bits(link_flag_bits, hdmi2)));
  const u32 frl_rate = std::min<u32>(hdmi2.frl_rate, most_frl_rate);
  blocks->put(low_byte(frl_rate << frl_rate_shift | flag_bits(video_flag_bits, hdmi2)));
  if (payload(hdmi2) >= payload_with_allm) blocks->put(low_byte(bit_if(hdmi2.allm, allm)));
  if (payload(hdmi2) < payload_with_vrr) return;
  const u32 maximum = std::min(hdmi2.vrr_max, most_vrr_maximum);
  const u32 minimum = std::min<u32>(hdmi2.vrr_min, vrr_minimum_mask);
  blocks->put(low_byte((maximum >> vrr_high_bits_shift & vrr_high_bits_mask) | minimum));
  blocks->put(low_byte(maximum));
}

}  // namespace

constinit const block_codec_t hdmi_forum_block{
    .identity = {"HDMI Forum block", data_block::vendor_specific, {0xD8, 0x5D, 0xC4}, 3, least_payload},
    .read = read,
    .payload = payload,
    .write = write,
};

constinit const block_identity_t sink_capability_structure{
    "HDMI Forum sink capability structure", data_block::extended, {0x79}, 1, least_payload};

}  // namespace edid_composer

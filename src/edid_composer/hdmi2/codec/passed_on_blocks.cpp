#include "edid_composer/hdmi2/codec/passed_on_blocks.h"

#include <algorithm>

namespace edid_composer {
namespace {

/// Extended tag of the vendor-specific video data block, which an OUI follows.
constexpr u8 vendor_specific_video = 0x01;

constexpr block_identity_t hdr_dynamic{"HDR dynamic metadata block", data_block::extended, {0x07}, 1, 4};
constexpr block_identity_t hdr10plus{
    "HDR10+ block", data_block::extended, {vendor_specific_video, 0x8B, 0x84, 0x90}, 4, 5};
constexpr block_identity_t dolby_vision{
    "Dolby Vision block", data_block::extended, {vendor_specific_video, 0x46, 0xD0, 0x00}, 4, 9};
constexpr block_identity_t freesync{"FreeSync block", data_block::vendor_specific, {0x1A, 0x00, 0x00}, 3, 8};

/// Dolby Vision: the byte after the OUI.
constexpr u32 version_byte = 4;
constexpr u32 version_shift = 5;
constexpr u8 support_2160p60 = 0x02;
constexpr u32 last_version_with_2160p60 = 1;

/// The codec of a block that the record keeps in a member. A kept block that is too short counts as none.
template <const block_identity_t &identity, hdmi2_block_t hdmi2_t::*member>
struct passed_on_t {
  static void read(const byte_view_t &block, hdmi2_t *hdmi2) {
    hdmi2_block_t &kept = hdmi2->*member;
    kept.length = low_byte(block.size() - 1);
    block.copy(1, kept.payload, kept.length);
  }

  static u32 payload(const hdmi2_t &hdmi2) {
    const u32 length = std::min<u32>((hdmi2.*member).length, HDMI2_MOST_BLOCK_BYTES);
    return length >= identity.least_payload ? length : 0;
  }

  static void write(const hdmi2_t &hdmi2, byte_writer_t *blocks) {
    blocks->put((hdmi2.*member).payload + identity.identifier_size, payload(hdmi2) - identity.identifier_size);
  }

  static constexpr block_codec_t codec{identity, read, payload, write};
};

}  // namespace

constinit const block_codec_t hdr_dynamic_block = passed_on_t<hdr_dynamic, &hdmi2_t::hdr_dynamic>::codec;
constinit const block_codec_t hdr10plus_block = passed_on_t<hdr10plus, &hdmi2_t::hdr10plus>::codec;
constinit const block_codec_t dolby_vision_block = passed_on_t<dolby_vision, &hdmi2_t::dolby_vision>::codec;
constinit const block_codec_t freesync_block = passed_on_t<freesync, &hdmi2_t::freesync>::codec;

u32 dolby_vision_version(const hdmi2_block_t &block) {
  return block.payload[version_byte] >> version_shift;
}

bool dolby_vision_has_2160p60(const hdmi2_block_t &block) {
  return dolby_vision_version(block) <= last_version_with_2160p60 &&
         (block.payload[version_byte] & support_2160p60) != 0;
}

}  // namespace edid_composer

// Decoding of an HDMI vendor-specific data block by itself.
#pragma once

#include "codec_fixture.h"
#include "edid_decode_encode/hdmi_vendor_block_decoder.h"

namespace codec_test {

inline bool decode_vendor_block(const bytes_t &block, edid_t *edid) {
  static constexpr edid_composer::site_t reporter{"edid_decode_encode", "_reporter"};
  const exact_bytes_t bytes(block);
  const edid_composer::appender_t<short_video_desc_t> modes(&edid->video_list, nullptr, reporter);
  return edid_composer::_decode_edid_vendor_block(edid_composer::byte_view_t(bytes.data(), bytes.size()), modes, edid);
}

}  // namespace codec_test

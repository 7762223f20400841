#include "extension_view.h"

#include <algorithm>

#include "support/edid_builder.h"

namespace end_to_end {
namespace {

constexpr std::size_t extension_offset = 128;
constexpr u8 video_tag = 2;
constexpr u8 vendor_tag = 3;

/// Numerator of the picture's shape, 4 (:3) or 16 (:9), by the image size of a detailed timing descriptor; 0 for any
/// other.
u32 shape_of(const u8 *descriptor) {
  const u32 width = descriptor[12] | (descriptor[14] >> 4) * 256U;
  const u32 height = descriptor[13] | (descriptor[14] & 0xFU) * 256U;
  if (width * 3 / 4 == height) return 4;
  return width * 9 / 16 == height ? 16 : 0;
}

}  // namespace

std::vector<data_block_t> data_blocks_of(const std::vector<u8> &edid) {
  std::vector<data_block_t> blocks;
  if (edid.size() < 256) return blocks;
  const std::size_t end = std::min<std::size_t>(extension_offset + edid[extension_offset + 2], 255);
  for (std::size_t at = extension_offset + 4; at < end;) {
    const std::size_t length = edid[at] & 0x1F;
    if (at + 1 + length > end) break;
    const auto payload = edid.begin() + static_cast<std::ptrdiff_t>(at) + 1;
    blocks.push_back({static_cast<u8>(edid[at] >> 5), at, {payload, payload + static_cast<std::ptrdiff_t>(length)}});
    at += 1 + length;
  }
  return blocks;
}

std::optional<data_block_t> hdmi_block_of(const std::vector<u8> &edid) {
  const std::vector<u8> oui{0x03, 0x0C, 0x00};
  for (const data_block_t &block : data_blocks_of(edid)) {
    if (block.tag != vendor_tag || block.payload.size() < 5) continue;
    if (std::equal(oui.begin(), oui.end(), block.payload.begin())) return block;
  }
  return std::nullopt;
}

std::vector<u8> vics_of(const std::vector<u8> &edid) {
  std::vector<u8> vics;
  for (const data_block_t &block : data_blocks_of(edid)) {
    if (block.tag != video_tag) continue;
    for (const u8 descriptor : block.payload)
      vics.push_back(descriptor & 0x7F);
  }
  return vics;
}

std::vector<u8> timing_vics_of(const std::vector<u8> &edid) {
  std::vector<std::size_t> offsets{54, 72, 90, 108};
  if (edid.size() >= 256) {
    for (std::size_t at = extension_offset + edid[extension_offset + 2]; at + 18 < 256; at += 18)
      offsets.push_back(at);
  }
  std::vector<u8> vics;
  for (const std::size_t at : offsets) {
    const auto descriptor = edid.begin() + static_cast<std::ptrdiff_t>(at);
    for (u32 vic = 1; vic <= 64; ++vic) {
      const std::vector<u8> known = test_support::timing_descriptor(test_support::timing_of_vic(vic));
      // Pixel clock and raster without the vertical blanking; the scan.
      const bool same_raster = std::equal(known.begin(), known.begin() + 6, descriptor) &&
                               known[7] >> 4 == descriptor[7] >> 4 && known[17] >> 7 == descriptor[17] >> 7;
      if (same_raster && shape_of(known.data()) == shape_of(&*descriptor)) vics.push_back(static_cast<u8>(vic));
    }
  }
  return vics;
}

std::string text_of(const std::vector<u8> &edid, u8 tag) {
  const std::vector<u8> header{0, 0, 0, tag, 0};
  for (std::size_t at = 54; at < 126; at += 18) {
    const auto descriptor = edid.begin() + static_cast<std::ptrdiff_t>(at);
    if (!std::equal(header.begin(), header.end(), descriptor)) continue;
    const std::string text(descriptor + 5, descriptor + 18);
    return text.substr(0, text.find('\n'));
  }
  return "";
}

}  // namespace end_to_end

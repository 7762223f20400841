#include "composed_edid.h"

#include <gtest/gtest.h>

namespace properties {
namespace {

using test_support::bytes_t;

constexpr std::size_t video_header = 128 + 4 + 4;  // Behind the extension's header and the speakers.
constexpr u32 full_video_block = 32;
constexpr u32 length_mask = 0x1F;
constexpr u32 longest_block = 31;

/// The payload of the 3D part; the header's lengths are only right when the whole block is not too long.
void take_3d_apart(const bytes_t &bytes, std::size_t at, u32 length, composed_edid_t *edid) {
  for (const std::size_t end = at + length; at < end; ++at) {
    const u32 order = bytes.at(at);
    const u32 structure = order & 0x0F;
    edid->structures.push_back({order >> 4, structure});
    if (structure == 8) ++at;
  }
}

void take_hdmi_apart(const bytes_t &bytes, std::size_t header, composed_edid_t *edid) {
  const auto byte = [&](std::size_t offset) { return u32{bytes.at(header + offset)}; };
  EXPECT_EQ(byte(0) >> 5, 3u);
  EXPECT_EQ(byte(1) | byte(2) << 8 | byte(3) << 16, 0x000C03u);
  edid->physical_address = {static_cast<u8>(byte(4) >> 4), static_cast<u8>(byte(4) & 15), static_cast<u8>(byte(5) >> 4),
                            static_cast<u8>(byte(5) & 15)};
  const u32 flags = byte(8);
  std::size_t video = 9;
  if ((flags & 0x80) != 0) video += 2;
  if ((flags & 0x40) != 0) video += 2;
  if ((flags & 0x20) == 0) return;
  edid->has_3d = (byte(video) & 0x80) != 0;
  const u32 vics = byte(video + 1) >> 5;
  const u32 length_3d = byte(video + 1) & length_mask;
  for (u32 i = 0; i < vics; ++i)
    edid->hdmi_vics.push_back(byte(video + 2 + i));
  const auto length = static_cast<u32>(video + 1 + vics + length_3d);
  if (length <= longest_block && length == (byte(0) & length_mask)) {
    take_3d_apart(bytes, header + video + 2 + vics, length_3d, edid);
  }
}

}  // namespace

composed_edid_t taken_apart(const bytes_t &bytes, u8 spa_offset) {
  composed_edid_t edid;
  EXPECT_EQ(bytes.at(video_header) >> 5, 2);
  const u32 in_header = bytes.at(video_header) & length_mask;
  const u32 count = in_header == 0 ? full_video_block : in_header;
  edid.native_first = (bytes.at(video_header + 1) & 0x80) != 0;
  for (u32 i = 1; i <= count; ++i)
    edid.vics.push_back(bytes.at(video_header + i) & 0x7Fu);
  const std::size_t audio_header = video_header + 1 + count;
  EXPECT_EQ(bytes.at(audio_header) >> 5, 1);
  const u32 audio_length = bytes.at(audio_header) & length_mask;
  for (std::size_t at = audio_header + 1; at < audio_header + 1 + audio_length; at += 3)
    edid.audio.push_back({bytes.at(at), bytes.at(at + 1), bytes.at(at + 2)});
  const std::size_t hdmi_header = audio_header + 1 + audio_length;
  EXPECT_EQ(spa_offset, hdmi_header + 4);
  take_hdmi_apart(bytes, hdmi_header, &edid);
  return edid;
}

u32 audio_type_of(const std::array<u8, 3> &descriptor) {
  const u32 code = descriptor[0] >> 3 & 15u;
  return code == 15 ? 15u + (descriptor[2] >> 3u) : code;
}

}  // namespace properties

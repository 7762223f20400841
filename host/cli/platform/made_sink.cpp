#include "platform/made_sink.h"

#include <algorithm>
#include <array>
#include <iterator>
#include <numeric>

#include "edid_input/edid_file.h"

namespace edid_cli {
namespace {

/// EDID 1.3, section 3: header, identity, version 1.3, digital, 70 cm x 40 cm, no timings but the detailed ones.
constexpr u8 base_block_begin[] = {0x00, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0x00, 0x6A, 0x21, 0x00, 0x00, 0x00, 0x00,
                                   0x00, 0x00, 0x01, 0x16, 0x01, 0x03, 0x80, 0x46, 0x28, 0x78, 0x0A, 0xEE, 0x91, 0xA3,
                                   0x54, 0x4C, 0x99, 0x26, 0x0F, 0x50, 0x54, 0x00, 0x00, 0x00, 0x01, 0x01, 0x01, 0x01,
                                   0x01, 0x01, 0x01, 0x01, 0x01, 0x01, 0x01, 0x01, 0x01, 0x01, 0x01, 0x01};
static_assert(sizeof base_block_begin == 54);
/// 1920x1080p50 and 1920x1080p60: the first detailed timing tells the family.
constexpr u8 timing_50[] = {0x02, 0x3A, 0x80, 0xD0, 0x72, 0x38, 0x2D, 0x40, 0x10,
                            0x2C, 0x45, 0x80, 0x00, 0x00, 0x00, 0x00, 0x00, 0x1E};
constexpr u8 timing_60[] = {0x02, 0x3A, 0x80, 0x18, 0x71, 0x38, 0x2D, 0x40, 0x58,
                            0x2C, 0x45, 0x00, 0x00, 0x00, 0x00, 0x00, 0x00, 0x1E};
/// The descriptor that holds nothing.
constexpr u8 dummy_descriptor[] = {0, 0, 0, 0x10, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0};

constexpr u8 video_tag = 0x40;
constexpr std::size_t longest_block = 31;
/// The library reads extensions whose data blocks end here at the latest, the four bytes of their header included.
constexpr std::size_t room = 110 - 4;

/// CEA-861, section 7.5.2: PCM, AC-3, MPEG-1, MP3, AAC, DTS, E-AC-3, DTS-HD, MLP and one-bit audio.
constexpr u8 audio_block[] = {0x3E, 0x0F, 0x7F, 0x07, 0x17, 0x07, 0x50, 0x1D, 0x07, 0x50, 0x25,
                              0x07, 0x28, 0x37, 0x1F, 0xC0, 0x3F, 0x07, 0xC0, 0x57, 0x07, 0x00,
                              0x5F, 0x7F, 0x01, 0x67, 0x7F, 0x00, 0x4F, 0x02, 0x00};
constexpr u8 speaker_block[] = {0x83, 0x7F, 0x07, 0x00};
/// CEA-861, section 7.5.5: xvYCC601 and xvYCC709.
constexpr u8 colorimetry_block[] = {0xE3, 0x05, 0x03, 0x01};
/// HDMI 1.4a, section 8.3.2: address 1.0.0.0, all colour depths, 340 MHz, four latencies of 40 and 20 ms, every content
/// type, 3D in all structures of the first 16 modes, all 4Kx2K modes.
constexpr u8 hdmi_block[] = {0x74, 0x03, 0x0C, 0x00, 0x10, 0x00, 0xF8, 0x44, 0xEF, 0x15, 0x0B,
                             0x15, 0x0B, 0xA0, 0x82, 0x01, 0x02, 0x03, 0x04, 0xFF, 0xFF};

template <std::size_t size>
void append(std::vector<u8> &edid, const u8 (&bytes)[size]) {
  edid.insert(edid.end(), bytes, bytes + size);
}

/// Fills a block up to its last byte and writes the checksum there.
void finish_block(std::vector<u8> &edid) {
  const std::size_t blocks = edid.size() / edid_block_size + 1;
  edid.resize(blocks * edid_block_size - 1);
  const auto begin = edid.end() - (edid_block_size - 1);
  edid.push_back(static_cast<u8>(0x100 - std::accumulate(begin, edid.end(), 0U) % 0x100));
}

void append_video_blocks(std::vector<u8> &edid, std::span<const u32> vics) {
  for (std::size_t first = 0; first < vics.size(); first += longest_block) {
    const auto block = vics.subspan(first, std::min(longest_block, vics.size() - first));
    edid.push_back(static_cast<u8>(video_tag | block.size()));
    std::transform(block.begin(), block.end(), std::back_inserter(edid), [](u32 vic) { return static_cast<u8>(vic); });
  }
}

/// How many modes fit beside the other blocks.
constexpr std::size_t most_modes() {
  constexpr std::size_t left =
      room - sizeof speaker_block - sizeof audio_block - sizeof hdmi_block - sizeof colorimetry_block;
  return left - (left + longest_block) / (longest_block + 1);
}

hdmi2_block_t block_of(std::initializer_list<u8> payload) {
  hdmi2_block_t block{};
  block.length = static_cast<u8>(payload.size());
  std::copy(payload.begin(), payload.end(), block.payload);
  return block;
}

hdmi2_t everything_of_hdmi2(std::span<const u32> vics) {
  hdmi2_t hdmi2{};
  hdmi2.size = sizeof hdmi2;
  hdmi2.svd_count = static_cast<u32>(std::min<std::size_t>(vics.size(), HDMI2_MOST_LISTED_VICS));
  std::transform(vics.begin(), vics.begin() + hdmi2.svd_count, hdmi2.svds,
                 [](u32 vic) { return static_cast<u8>(vic); });
  hdmi2.forum_present = hdmi2.forum_version = hdmi2.scdc = hdmi2.uhd_vic = 1;
  hdmi2.max_tmds_rate = 600;
  hdmi2.dc_30bit_420 = hdmi2.dc_36bit_420 = 1;
  hdmi2.allm_present = hdmi2.allm = hdmi2.vrr_present = 1;
  hdmi2.vrr_min = 48;
  hdmi2.vrr_max = 120;
  hdmi2.video_capability_present = hdmi2.rgb_quantization = hdmi2.ycc_quantization = 1;
  hdmi2.colorimetry_present = 1;
  hdmi2.colorimetry = HDMI2_BT2020_RGB | HDMI2_BT2020_YCC | HDMI2_BT2020_CYCC;
  hdmi2.hdr_static_present = hdmi2.metadata_types = 1;
  hdmi2.eotfs = HDMI2_EOTF_SDR | HDMI2_EOTF_GAMMA | HDMI2_EOTF_PQ | HDMI2_EOTF_HLG;
  hdmi2.luminance_count = 3;
  hdmi2.luminance[0] = hdmi2.luminance[1] = 96;
  hdmi2.y420_map_present = 1;
  hdmi2.hdr10plus = block_of({0x01, 0x8B, 0x84, 0x90, 0x01});
  hdmi2.dolby_vision = block_of({0x01, 0x46, 0xD0, 0x00, 0x48, 0, 0, 0, 0, 0, 0});
  hdmi2.freesync = block_of({0x1A, 0x00, 0x00, 0x01, 0x01, 48, 120, 0});
  return hdmi2;
}

void append_hdmi2_extension(std::vector<u8> &edid, std::span<const u32> vics) {
  constexpr std::size_t header = 4;
  u8 blocks[room] = {};
  u32 used = 0;
  const hdmi2_t hdmi2 = everything_of_hdmi2(vics);
  encode_hdmi2(&hdmi2, blocks, sizeof blocks, &used);
  edid.insert(edid.end(), {0x02, 0x03, static_cast<u8>(header + used), 0xF0});
  edid.insert(edid.end(), blocks, blocks + used);
  finish_block(edid);
}

}  // namespace

std::vector<u8> made_sink(u32 family, std::span<const u32> vics, std::span<const u32> extended_vics) {
  std::vector<u8> edid(std::begin(base_block_begin), std::end(base_block_begin));
  family == 50 ? append(edid, timing_50) : append(edid, timing_60);
  append(edid, dummy_descriptor);
  append(edid, dummy_descriptor);
  append(edid, dummy_descriptor);
  edid.push_back(extended_vics.empty() ? 1 : 2);
  finish_block(edid);

  edid.insert(edid.end(), {0x02, 0x03, 0x00, 0xF0});
  append(edid, speaker_block);
  append_video_blocks(edid, vics.first(std::min(vics.size(), most_modes())));
  append(edid, audio_block);
  append(edid, hdmi_block);
  append(edid, colorimetry_block);
  // No detailed timings follow; they would begin here.
  edid[edid_block_size + 2] = static_cast<u8>(edid.size() - edid_block_size);
  finish_block(edid);
  if (!extended_vics.empty()) {
    append_hdmi2_extension(edid, extended_vics);
  }
  return edid;
}

}  // namespace edid_cli

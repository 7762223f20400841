// What this library's decoder reads in an EDID on standard input, as one JSON object: the half of a comparison that
// another program's reading is the other half of.
#include <cstdio>
#include <iterator>
#include <string>
#include <vector>

#include "edid_composer.h"
#include "support/list_contents.h"

namespace {

constexpr u32 block_size = 128;

std::vector<u8> standard_input() {
  std::vector<u8> bytes;
  for (int byte = std::getchar(); byte != EOF; byte = std::getchar())
    bytes.push_back(static_cast<u8>(byte));
  return bytes;
}

bool decode(const std::vector<u8> &bytes, edid_t &edid) {
  if (bytes.size() < block_size || decode_edid_block_0(bytes.data(), &edid) == 0) return false;
  return bytes.size() == block_size ||
         decode_edid_extensions(bytes.data() + block_size, static_cast<u32>(bytes.size()) - block_size, &edid) != 0;
}

const char *comma(bool needed) {
  return needed ? "," : "";
}

void print_modes(const edid_t &edid) {
  std::printf("\"modes\":[");
  bool behind_another = false;
  for (const auto &mode : test_support::elements_of<short_video_desc_t>(edid.video_list)) {
    std::printf("%s{\"vic\":%u,\"native\":%u,\"stereo\":%u}", comma(behind_another), mode.vic, mode.native,
                mode.stereo);
    behind_another = true;
  }
  std::printf("],\n");
}

void print_audio(const edid_t &edid) {
  std::printf("\"audio\":[");
  bool behind_another = false;
  for (const auto &audio : test_support::elements_of<short_audio_desc_t>(edid.audio_list)) {
    std::printf("%s{\"type\":%u,\"channels\":%u,\"rates\":%u,\"sizes\":%u,\"bit_rate\":%u,\"value\":%u,\"profile\":%u}",
                comma(behind_another), audio.type, audio.channels, audio.frequencies, audio.pcm_bits, audio.max_bitrate,
                audio.value, audio.wma_profile);
    behind_another = true;
  }
  std::printf("],\n");
}

void print_hdmi(const edid_t &edid) {
  std::printf("\"hdmi\":%u,\n", edid.hdmi_present);
  std::printf("\"address\":[%u,%u,%u,%u],\n", edid.physical_address[0], edid.physical_address[1],
              edid.physical_address[2], edid.physical_address[3]);
  std::printf("\"supports_ai\":%u,\"dc_48bit\":%u,\"dc_36bit\":%u,\"dc_30bit\":%u,\"dc_y444\":%u,\"dvi_dual\":%u,\n",
              edid.supports_ai, edid.dc_48bit, edid.dc_36bit, edid.dc_30bit, edid.dc_y444, edid.dvi_dual);
  std::printf("\"tmds_clock\":%u,\n", edid.max_tmds_clock);
  std::printf("\"content_types\":[%u,%u,%u,%u],\n", edid.cnc0, edid.cnc1, edid.cnc2, edid.cnc3);
  std::printf("\"latency_ms\":[%u,%u,%u,%u],\n", edid.video_latency, edid.audio_latency, edid.i_video_latency,
              edid.i_audio_latency);
  std::printf("\"3d_present\":%u,\n\"hdmi_vics\":[", edid.hdmi_3d_present);
  for (u32 index = 0; index < edid.hdmi_vic_len; ++index)
    std::printf("%s%u", comma(index > 0), edid.hdmi_vic[index]);
  std::printf("],\n");
}

}  // namespace

int main() {
  const std::vector<u8> bytes = standard_input();
  edid_t edid{};
  if (edid_prepare(&edid) == 0) return 1;
  const bool decoded = decode(bytes, edid);
  if (decoded) {
    std::printf("{\n");
    print_modes(edid);
    print_audio(edid);
    print_hdmi(edid);
    std::printf("\"xvycc601\":%u,\"xvycc709\":%u\n}\n", edid.xvycc601, edid.xvycc709);
  }
  return edid_destroy(&edid) != 0 && decoded ? 0 : 1;
}

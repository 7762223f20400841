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

void print_array(const char *name, const u8 *bytes, u32 count) {
  std::printf(",\n\"%s\":[", name);
  for (u32 i = 0; i < count; ++i)
    std::printf("%s%u", comma(i > 0), bytes[i]);
  std::printf("]");
}

struct hdmi2_number_t {
  const char *name;
  u8 hdmi2_t::*member;
};
#define NUMBER(member) \
  { #member, &hdmi2_t::member }
constexpr hdmi2_number_t hdmi2_numbers[] = {
    NUMBER(forum_present),
    NUMBER(forum_version),
    NUMBER(scdc),
    NUMBER(read_request),
    NUMBER(scramble_low),
    NUMBER(frl_rate),
    NUMBER(uhd_vic),
    NUMBER(dc_48bit_420),
    NUMBER(dc_36bit_420),
    NUMBER(dc_30bit_420),
    NUMBER(allm),
    NUMBER(vrr_min),
    NUMBER(ycc_quantization),
    NUMBER(rgb_quantization),
    NUMBER(preferred_scan),
    NUMBER(it_scan),
    NUMBER(ce_scan),
    NUMBER(video_capability_present),
    NUMBER(colorimetry),
    NUMBER(gamut_metadata),
    NUMBER(colorimetry_present),
    NUMBER(hdr_static_present),
    NUMBER(eotfs),
    NUMBER(metadata_types),
    NUMBER(y420_map_present),
};
#undef NUMBER

void print_hdmi2_record(const hdmi2_t &hdmi2) {
  std::printf("\"hdmi2\":{\"max_tmds_rate\":%u,\"vrr_max\":%u", hdmi2.max_tmds_rate, hdmi2.vrr_max);
  for (const auto &[name, member] : hdmi2_numbers)
    std::printf(",\n\"%s\":%u", name, hdmi2.*member);
  print_array("svds", hdmi2.svds, hdmi2.svd_count);
  print_array("y420_vics", hdmi2.y420_vics, hdmi2.y420_count);
  print_array("map", hdmi2.y420_map, hdmi2.y420_map_bytes);
  print_array("luminance", hdmi2.luminance, hdmi2.luminance_count);
  print_array("hdr_dynamic", hdmi2.hdr_dynamic.payload, hdmi2.hdr_dynamic.length);
  print_array("hdr10plus", hdmi2.hdr10plus.payload, hdmi2.hdr10plus.length);
  print_array("dolby_vision", hdmi2.dolby_vision.payload, hdmi2.dolby_vision.length);
  print_array("freesync", hdmi2.freesync.payload, hdmi2.freesync.length);
  std::printf("},\n");
}

}  // namespace

int main() {
  const std::vector<u8> bytes = standard_input();
  edid_t edid{};
  if (edid_prepare(&edid) == 0) return 1;
  hdmi2_t hdmi2{};
  hdmi2.size = sizeof hdmi2;
  const bool decoded = decode(bytes, edid) && decode_hdmi2(bytes.data(), static_cast<u32>(bytes.size()), &hdmi2);
  if (decoded) {
    std::printf("{\n");
    print_modes(edid);
    print_audio(edid);
    print_hdmi(edid);
    print_hdmi2_record(hdmi2);
    std::printf("\"xvycc601\":%u,\"xvycc709\":%u\n}\n", edid.xvycc601, edid.xvycc709);
  }
  return edid_destroy(&edid) != 0 && decoded ? 0 : 1;
}

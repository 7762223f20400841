#include "explain/hdmi2_features.h"

#include <algorithm>
#include <iterator>

namespace edid_cli {
namespace {

constexpr hdmi2_feature_t features[] = {
    {COMPOSE_SUBJECT_LINK_RATE, any_code, "TMDS rate", "hdmi2.tmds_limit"},
    {COMPOSE_SUBJECT_HDR, HDMI2_EOTF_GAMMA, "HDR with traditional gamma", "hdmi2.hdr_gamma"},
    {COMPOSE_SUBJECT_HDR, HDMI2_EOTF_PQ, "HDR with PQ (HDR10)", "hdmi2.hdr_pq"},
    {COMPOSE_SUBJECT_HDR, HDMI2_EOTF_HLG, "HDR with HLG", "hdmi2.hdr_hlg"},
    {COMPOSE_SUBJECT_COLORIMETRY, HDMI2_XVYCC601, "xvYCC601", "xvYCC601"},
    {COMPOSE_SUBJECT_COLORIMETRY, HDMI2_XVYCC709, "xvYCC709", "xvYCC709"},
    {COMPOSE_SUBJECT_COLORIMETRY, HDMI2_BT2020_CYCC, "BT.2020 with constant luminance", "hdmi2.bt2020_cycc"},
    {COMPOSE_SUBJECT_COLORIMETRY, HDMI2_BT2020_YCC, "BT.2020 in YCbCr", "hdmi2.bt2020_ycc"},
    {COMPOSE_SUBJECT_COLORIMETRY, HDMI2_BT2020_RGB, "BT.2020 in RGB", "hdmi2.bt2020_rgb"},
    {COMPOSE_SUBJECT_YCBCR_420, any_code, "YCbCr 4:2:0", "hdmi2.y420"},
    {COMPOSE_SUBJECT_DEEP_COLOR_420, 30, "deep colour in 4:2:0, 30 bits", "hdmi2.dc_30bit_420"},
    {COMPOSE_SUBJECT_DEEP_COLOR_420, 36, "deep colour in 4:2:0, 36 bits", "hdmi2.dc_36bit_420"},
    {COMPOSE_SUBJECT_ALLM, any_code, "auto low-latency mode", "hdmi2.allm"},
    {COMPOSE_SUBJECT_VRR, any_code, "variable refresh rate", "hdmi2.vrr"},
    {COMPOSE_SUBJECT_QUANTIZATION, 0, "selectable quantization of RGB", "hdmi2.rgb_quantization"},
    {COMPOSE_SUBJECT_QUANTIZATION, 1, "selectable quantization of YCbCr", "hdmi2.ycc_quantization"},
    {COMPOSE_SUBJECT_PASSED_BLOCK, COMPOSE_ROOM_FREESYNC, "FreeSync", "hdmi2.pass_freesync"},
    {COMPOSE_SUBJECT_PASSED_BLOCK, COMPOSE_ROOM_HDR_DYNAMIC, "HDR dynamic metadata", "hdmi2.pass_hdr_dynamic"},
    {COMPOSE_SUBJECT_PASSED_BLOCK, COMPOSE_ROOM_HDR10PLUS, "HDR10+", "hdmi2.pass_hdr10plus"},
    {COMPOSE_SUBJECT_PASSED_BLOCK, COMPOSE_ROOM_DOLBY_VISION, "Dolby Vision", "hdmi2.pass_dolby_vision"},
    {COMPOSE_SUBJECT_UHD_VIC, any_code, "VICs of 4Kx2K modes", "hdmi2.uhd_vic"},
    {COMPOSE_SUBJECT_PREFERRED_TIMING, any_code, "preferred mode above VIC 64", "hdmi2.preferred_extended"},
};

}  // namespace

std::span<const hdmi2_feature_t> hdmi2_features() {
  return features;
}

const hdmi2_feature_t *find_hdmi2_feature(u32 subject, u32 code) {
  const auto *const found = std::find_if(std::begin(features), std::end(features), [=](const auto &feature) {
    return feature.subject == subject && (feature.code == any_code || feature.code == code);
  });
  return found != std::end(features) ? found : nullptr;
}

bool is_of_hdmi2(u32 subject) {
  return subject >= COMPOSE_SUBJECT_EXTENDED_MODE && subject <= COMPOSE_SUBJECT_ROOM_ITEM;
}

}  // namespace edid_cli

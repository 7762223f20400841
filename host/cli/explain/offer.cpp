#include "explain/offer.h"

#include <algorithm>

#include "edid_text/decoded_edid.h"
#include "edid_text/mode_names.h"
#include "explain/hdmi2_features.h"
#include "io/standard_output.h"

namespace edid_cli {
namespace {

/// Without an extension that is announced a source reads the base block only.
bool is_extension_announced(const new_edid_t &new_edid) {
  constexpr std::size_t extension_count_offset = 126;
  return new_edid[extension_count_offset] != 0;
}

std::vector<u8> bytes_that_are_read(const new_edid_t &new_edid) {
  return {new_edid.begin(), new_edid.begin() + (is_extension_announced(new_edid) ? 256 : 128)};
}

template <typename entry_t, typename predicate_t>
bool any_of(const ll_list_t &list, predicate_t predicate) {
  for (const ll_entry_t *entry = list.head; entry != nullptr; entry = entry->next) {
    if (predicate(*static_cast<const entry_t *>(entry->data))) {
      return true;
    }
  }
  return false;
}

bool has_short_descriptor(const edid_t &edid, u32 vic) {
  return any_of<short_video_desc_t>(edid.video_list, [vic](const auto &mode) { return mode.vic == vic; });
}

bool has_detailed_timing(const edid_t &edid, u32 vic) {
  return any_of<detailed_timing_t>(edid.dtd_list, [&edid, vic](const auto &timing) {
    u32 vic_of_timing = 0;
    return convert_dtd_to_vic(&edid, &timing, &vic_of_timing) == 1 && vic_of_timing == vic;
  });
}

u32 channels_of(const edid_t &edid, u32 type) {
  u32 most = 0;
  for (const ll_entry_t *entry = edid.audio_list.head; entry != nullptr; entry = entry->next) {
    const auto &format = *static_cast<const short_audio_desc_t *>(entry->data);
    most = format.type == type ? std::max<u32>(most, format.channels) : most;
  }
  return most;
}

bool has_extended_mode(const hdmi2_t &hdmi2, u32 vic) {
  const auto is_it = [vic](u8 code) { return decoded_svd(code).vic == vic; };
  return std::any_of(hdmi2.svds, hdmi2.svds + hdmi2.svd_count, is_it) ||
         std::any_of(hdmi2.y420_vics, hdmi2.y420_vics + hdmi2.y420_count, is_it);
}

bool has_passed_block(const hdmi2_t &hdmi2, u32 block) {
  switch (block) {
    case COMPOSE_ROOM_HDR10PLUS:
      return hdmi2.hdr10plus.length != 0;
    case COMPOSE_ROOM_DOLBY_VISION:
      return hdmi2.dolby_vision.length != 0;
    case COMPOSE_ROOM_FREESYNC:
      return hdmi2.freesync.length != 0;
    default:
      return hdmi2.hdr_dynamic.length != 0;
  }
}

bool has_feature(const hdmi2_t &hdmi2, const wanted_t &wanted) {
  switch (wanted.subject) {
    case COMPOSE_SUBJECT_EXTENDED_MODE:
      return has_extended_mode(hdmi2, wanted.code);
    case COMPOSE_SUBJECT_HDR:
      return (hdmi2.eotfs & wanted.code) != 0;
    case COMPOSE_SUBJECT_COLORIMETRY:
      return (hdmi2.colorimetry & wanted.code) != 0;
    case COMPOSE_SUBJECT_YCBCR_420:
      return hdmi2.y420_count != 0 || hdmi2.y420_map_present != 0;
    case COMPOSE_SUBJECT_ALLM:
      return hdmi2.allm != 0;
    case COMPOSE_SUBJECT_VRR:
      return hdmi2.vrr_min != 0;
    default:
      return has_passed_block(hdmi2, wanted.code);
  }
}

bool has_depth(const edid_t &edid, u32 bits) {
  return bits == 30 ? edid.dc_30bit != 0 : bits == 36 ? edid.dc_36bit != 0 : edid.dc_48bit != 0;
}

}  // namespace

bool is_offered(const wanted_t &wanted, const new_edid_t &new_edid) {
  const discarded_output_t unseen;
  const decoded_edid_t decoded(bytes_that_are_read(new_edid));
  const edid_t &edid = decoded.record();
  if (is_of_hdmi2(wanted.subject)) {
    return has_feature(decoded.hdmi2(), wanted);
  }
  switch (wanted.subject) {
    case COMPOSE_SUBJECT_4K_MODE: {
      const auto *const end = edid.hdmi_vic + std::min<std::size_t>(edid.hdmi_vic_len, std::size(edid.hdmi_vic));
      return std::find(edid.hdmi_vic, end, wanted.code) != end;
    }
    case COMPOSE_SUBJECT_AUDIO_FORMAT:
      return channels_of(edid, wanted.code) >= std::max(wanted.channels, 1U);
    case COMPOSE_SUBJECT_DEEP_COLOR:
      return has_depth(edid, wanted.code);
    case COMPOSE_SUBJECT_3D:
      return edid.hdmi_3d_present != 0;
    default:
      return is_extension_announced(new_edid) ? has_short_descriptor(edid, wanted.code)
                                              : has_detailed_timing(edid, wanted.code);
  }
}

}  // namespace edid_cli

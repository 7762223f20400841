#include "edid_text/decoded_edid.h"

#include <algorithm>

#include "edid_input/edid_file.h"
#include "edid_text/mode_names.h"

namespace edid_cli {

decoded_edid_t::decoded_edid_t(const std::vector<u8> &bytes) : is_prepared_(edid_prepare(&record_) != 0) {
  if (!is_prepared_) {
    return;
  }
  is_complete_ = decode_edid_block_0(bytes.data(), &record_) != 0;
  if (is_complete_) {
    hdmi2_ = decoded_hdmi2(bytes);
  }
  if (is_complete_ && bytes.size() > edid_block_size) {
    const auto size = static_cast<u32>(bytes.size()) - edid_block_size;
    is_complete_ = decode_edid_extensions(bytes.data() + edid_block_size, size, &record_) != 0;
  }
}

decoded_edid_t::~decoded_edid_t() {
  if (is_prepared_) {
    edid_destroy(&record_);
  }
}

hdmi2_t decoded_hdmi2(const std::vector<u8> &bytes) {
  hdmi2_t hdmi2{};
  hdmi2.size = sizeof hdmi2;
  decode_hdmi2(bytes.data(), static_cast<u32>(bytes.size()), &hdmi2);
  return hdmi2;
}

bool has_hdmi2(const hdmi2_t &hdmi2) {
  const bool has_picture_block =
      hdmi2.video_capability_present != 0 || hdmi2.colorimetry_present != 0 || hdmi2.hdr_static_present != 0;
  const bool has_420 = hdmi2.y420_count != 0 || hdmi2.y420_map_present != 0;
  const bool has_vendors_block = hdmi2.forum_present != 0 || hdmi2.hdr_dynamic.length != 0 ||
                                 hdmi2.hdr10plus.length != 0 || hdmi2.dolby_vision.length != 0 ||
                                 hdmi2.freesync.length != 0;
  return has_picture_block || has_420 || has_vendors_block ||
         std::any_of(hdmi2.svds, hdmi2.svds + hdmi2.svd_count,
                     [](u8 code) { return decoded_svd(code).vic > last_library_vic; });
}

}  // namespace edid_cli

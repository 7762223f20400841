// A record for the report in which everything that is printed is there.
#pragma once

#include <cstring>

#include "codec_fixture.h"

namespace codec_test {

class reported_record_t {
 public:
  reported_record_t() {
    fill_base_block();
    fill_extension();
  }
  edid_t *get() { return edid_.get(); }
  edid_t *operator->() { return edid_.get(); }

 private:
  void fill_base_block() {
    edid_->valid = 1;
    std::memcpy(edid_->manufacturer, "TST", 4);
    edid_->product_code = 0x1A2B;
    edid_->serial_number = 0xFFFFFFFE;
    edid_->week = 42;
    edid_->year = 2024;
    edid_->version = 1;
    edid_->revision = 4;
    edid_->h_size_cm = 160;
    edid_->v_size_cm = 90;
    edid_->gamma = 120;
    edid_->standby = 1;
    edid_->active_off = 1;
    edid_->preferred_timing = 1;
    edid_->est_timings_1 = 0x21;
    edid_->est_timings_2 = 0x09;
    edid_->man_timings = 0x81;
    append(edid_->std_timings, std_timing_t{1280, 2, 60});
    append(edid_->std_timings, std_timing_t{1920, 3, 75});
    append(edid_->dtd_list, test_support::timing_of_vic(16));
    append(edid_->dtd_list, interlaced_timing());
    std::memcpy(edid_->serial_string, "SN 0042", 8);
    std::memcpy(edid_->data_string, "Some data", 10);
    std::memcpy(edid_->monitor_name, "TEST TV", 8);
    edid_->min_v_rate = 24;
    edid_->max_v_rate = 75;
    edid_->min_h_rate = 15;
    edid_->max_h_rate = 135;
    edid_->max_pixel_clock = 300;
    edid_->extension_count = 1;
  }

  void fill_extension() {
    append_video(edid_.get(), 16, 0, 1);
    append_video(edid_.get(), 4, 0x07);
    append_video(edid_.get(), 39, 0xF8, 1);
    append_video(edid_.get(), 65);
    append(edid_->audio_list, short_audio_desc_t{1, 8, 0x7F, 7, 0, 0, 0});
    append(edid_->audio_list, short_audio_desc_t{2, 6, 0x07, 0, 640, 0, 0});
    append(edid_->audio_list, short_audio_desc_t{10, 8, 0x06, 0, 0, 3, 0});
    append(edid_->audio_list, short_audio_desc_t{14, 2, 0x04, 0, 0, 0, 5});
    append(edid_->audio_list, short_audio_desc_t{17, 6, 0x00, 0, 0, 0, 0});
    append(edid_->audio_list, short_audio_desc_t{0, 2, 0x04, 0, 0, 0, 0});
    edid_->underscan = 1;
    edid_->basic_audio = 0;
    edid_->speaker[0] = 0x0F;
    edid_->hdmi_present = 1;
    const u8 address[] = {1, 2, 0, 15};
    std::memcpy(edid_->physical_address, address, 4);
    edid_->dc_36bit = 1;
    edid_->dc_y444 = 1;
    edid_->max_tmds_clock = 225;
    edid_->supports_ai = 1;
    edid_->cnc1 = 1;
    edid_->cnc3 = 1;
    edid_->hdmi_video_present = 1;
    edid_->hdmi_3d_present = 1;
    edid_->hdmi_vic_len = 2;
    edid_->hdmi_vic[0] = 1;
    edid_->hdmi_vic[1] = 4;
    edid_->hdmi_vic[2] = 2;
    edid_->xvycc601 = 1;
  }

  static detailed_timing_t interlaced_timing() {
    detailed_timing_t timing = test_support::timing_of_vic(5);
    timing.h_border = 3;
    timing.v_border = 4;
    timing.stereo = 1;
    timing.h_sync_positive = 0;
    timing.v_sync_positive = 0;
    timing.h_image_size = 0;
    timing.v_image_size = 25;
    return timing;
  }

  scoped_edid_t edid_;
};

/// What the report prints; its result must be 1.
inline std::string report_of(const edid_t *edid, u8 brief, const char *title = "TITLE") {
  return output_of([&] { EXPECT_EQ(print_edid_struct(edid, brief, title), 1); });
}

/// Gives a list and its entries the tag of another type.
inline void mistype(ll_list_t &list, u32 tag) {
  list.type = tag;
  for (ll_entry_t *entry = list.head; entry != nullptr; entry = entry->next)
    entry->type = tag;
}

inline std::string report_error(const std::string &message) {
  return codec_error("print_edid_struct", message);
}

/// A text with one part replaced, which must be in it once.
inline std::string with(std::string text, const std::string &part, const std::string &replacement) {
  EXPECT_EQ(test_support::count_of(text, part), 1) << part;
  const std::size_t at = text.find(part);
  return at == std::string::npos ? text : text.replace(at, part.size(), replacement);
}

}  // namespace codec_test

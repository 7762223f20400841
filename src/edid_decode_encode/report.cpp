// The report of a decoded record.
#include <algorithm>
#include <iterator>

#include "diagnostics.h"
#include "linked_list/typed_list.h"
#include "output.h"
#include "text_field.h"
#include "utility/timing.h"
#include "utility/timing_lines.h"

namespace edid_composer {
namespace {

REPORTS_AS(print_edid_struct);

const char *supported(u8 flag) {
  return flag != 0 ? "supported" : "unsupported";
}
const char *native(u8 flag) {
  return flag != 0 ? "Native" : "";
}

u32 inches_of_cm(u32 centimetres) {
  return centimetres * 50 / 127;
}

u32 hdmi_vic_count(const edid_t &edid) {
  return std::min<u32>(edid.hdmi_vic_len, static_cast<u32>(std::size(edid.hdmi_vic)));
}

/// One mode with its 3D structures, indented; the line goes on after it.
void print_mode(const char *indent, const short_video_desc_t &video) {
  print("%s%d\t%s ", indent, video.vic, short_video_timing_string(video.vic));
  print_stereo_type(video.stereo);
}

void print_modes(const char *indent, const edid_t *edid) {
  for (const auto &video : walk<const short_video_desc_t>(LIST(&edid->video_list, "&edid->video_list"))) {
    print_mode(indent, video);
    print(" %s\n", native(video.native));
  }
}

void print_mandatory_3d_modes(const char *indent) {
  for (const auto &mode : _3d_man_modes) {
    print_mode(indent, mode);
    print("\n");
  }
}

void print_hdmi_vics(const char *indent, const edid_t &edid) {
  for (u32 i = 0; i < hdmi_vic_count(edid); ++i) {
    print("%s%d\t%s\n", indent, edid.hdmi_vic[i], hdmi_vic_string(edid.hdmi_vic[i]));
  }
}

void print_audio(const char *indent, const edid_t *edid) {
  for (const auto &audio : walk<const short_audio_desc_t>(LIST(&edid->audio_list, "&edid->audio_list"))) {
    print("%s", indent);
    print_audio_structure(&audio);
  }
}

void print_brief(const edid_t *edid, const char *title) {
  constexpr const char *indent = "\t  ";
  const text_field_t monitor_name(edid->monitor_name);
  const text_field_t serial_string(edid->serial_string);
  const text_field_t data_string(edid->data_string);
  print("%s\n", title);
  print("\tManufacter   : %s\n", text_field_t(edid->manufacturer).c_str());
  if (!monitor_name.empty()) print("\tMonitor Name : \"%s\"\n", monitor_name.c_str());
  print("\tSerial Number: %d\n", edid->serial_number);
  if (!serial_string.empty()) print("\tSerial String: \"%s\"\n", serial_string.c_str());
  if (!data_string.empty()) print("\tData String  : \"%s\"\n", data_string.c_str());
  print("\n\tVics:\n");
  print_modes(indent, edid);
  if (edid->hdmi_vic_len != 0) {
    print("\n\t4k x 2k Modes:\n");
    print_hdmi_vics(indent, *edid);
  }
  if (edid->hdmi_3d_present != 0) {
    print("\n\tMandatory 3D modes:\n");
    print_mandatory_3d_modes(indent);
  }
  if (ll_size(&edid->audio_list) > 0) {
    print("\n\tAudio:\n");
    print_audio(indent, edid);
  }
  const u8 *const address = edid->physical_address;
  print("\n\tAddress=%d.%d.%d.%d\n", address[0], address[1], address[2], address[3]);
}

void print_identity(const edid_t &edid) {
  const text_field_t monitor_name(edid.monitor_name);
  const text_field_t serial_string(edid.serial_string);
  const text_field_t data_string(edid.data_string);
  print("Version.Revision    = %d.%d\n", edid.version, edid.revision);
  print("Manufacture Name    = %s\n", text_field_t(edid.manufacturer).c_str());
  if (!monitor_name.empty()) print("Monitor name        = \"%s\"\n", monitor_name.c_str());
  print("Serial Number       = 0x%x\n", edid.serial_number);
  if (!serial_string.empty()) print("Serial String       = \"%s\"\n", serial_string.c_str());
  if (!data_string.empty()) print("Monitor data        = \"%s\"\n", data_string.c_str());
  print("Product Code        = 0x%x\n", edid.product_code);
  print("Week of manufacture = %u\n", edid.week);
  print("Year of manufacture = %u\n", edid.year);
}

void print_features(const edid_t &edid) {
  const u32 gamma = edid.gamma + 100;
  // kept: no leading zero in the fraction.
  print("Gamma               = %d.%d\n", gamma / 100, gamma % 100);
  if (edid.h_size_cm == 0 || edid.v_size_cm == 0) {
    print("Horizontal/Vertical image sizes are set to 0.\n");
  } else {
    print("Horizontal size     = %d cm (%d in)\n", edid.h_size_cm, inches_of_cm(edid.h_size_cm));
    print("Vertical size       = %d cm (%d in)\n", edid.v_size_cm, inches_of_cm(edid.v_size_cm));
  }
  print("\nPower Management\n");
  print("\tStand-by              = %s\n", supported(edid.standby));
  print("\tSuspend               = %s\n", supported(edid.suspend));
  print("\tActive-off            = %s\n", supported(edid.active_off));
  print("\tStandard colorspace   = %s\n", true_or_false(edid.standard_colorspace != 0));
  print("\tPreferred timing mode = %s\n", true_or_false(edid.preferred_timing != 0));
  print("\tGTF                   = %s\n", supported(edid.gtf));
  // kept: the timing bytes follow this heading; the chromaticity coordinates are not printed.
  print("\nColorimetry:\n");
  print_est_man_type(edid.est_timings_1, est_timing_1_string, "Established Timings 1");
  print_est_man_type(edid.est_timings_2, est_timing_2_string, "Established Timings 2");
  print_est_man_type(edid.man_timings, man_timing_string, "Manufacturer Timings");
}

void print_standard_timings(const edid_t *edid) {
  print("\nStandard Timings: - %d timings\n", ll_size(&edid->std_timings));
  for (const auto &timing : walk<const std_timing_t>(LIST(&edid->std_timings, "&edid->std_timings"))) {
    print("\t%dx", timing.h_active);
    if (timing.aspect_ratio < std::size(aspect_ratios)) {
      const aspect_ratio_t &aspect = aspect_ratios[timing.aspect_ratio];
      print("%d", timing.h_active * aspect.height / aspect.width);
    }
    print("p%d\n", timing.refresh_rate);
  }
}

void print_detailed_timing(i32 number, const detailed_timing_t &timing) {
  print("Timing %d: %dx%d%s%d\n", number, timing.h_active, frame_height(timing), timing.progressive != 0 ? "p" : "i",
        refresh_rate(timing));
  for (const auto &line : timing_lines_t(timing))
    print("%s\n", line);
}

void print_detailed_timings(const edid_t *edid) {
  print("\nDetailed Timing Descriptions: - %d timings\n", ll_size(&edid->dtd_list));
  i32 number = 0;
  for (const auto &timing : walk<const detailed_timing_t>(LIST(&edid->dtd_list, "&edid->dtd_list"))) {
    if (timing.valid != 0) print_detailed_timing(number, timing);
    ++number;
  }
}

void print_limits(const edid_t &edid) {
  print("\nMonitor Limits:\n");
  print("\tMin Vertical Rate:   %d Hz\n", edid.min_v_rate);
  print("\tMax Vertical Rate:   %d Hz\n", edid.max_v_rate);
  print("\tMin Horizontal Rate: %d KHz\n", edid.min_h_rate);
  print("\tMax Horizontal Rate: %d KHz\n", edid.max_h_rate);
  print("\tMax Pixel Clock:     %d MHz\n", edid.max_pixel_clock);
  print("Number of extension blocks = %d\n", edid.extension_count);
}

void print_video_and_audio(const edid_t *edid) {
  constexpr const char *indent = "\t";
  print("\nShort Video Codes: Num:%d\n", ll_size(&edid->video_list));
  print_modes(indent, edid);
  if (edid->hdmi_3d_present != 0) {
    print("\nMandatory 3D modes: Num:%d\n", static_cast<int>(std::size(_3d_man_modes)));
    print_mandatory_3d_modes(indent);
  }
  if (edid->hdmi_vic_len != 0) {
    print("\n4k x 2k Modes: Num:%d\n", edid->hdmi_vic_len);
    print_hdmi_vics(indent, *edid);
  }
  print("\nShort Audio Codes: Num:%d\n", ll_size(&edid->audio_list));
  print_audio(indent, edid);
  print("\nSpeaker config    = ");
  print_speaker(edid->speaker[0], edid->speaker[1], edid->speaker[2]);
}

void print_hdmi(const edid_t &edid) {
  const u8 *const address = edid.physical_address;
  print("Address           = %d.%d.%d.%d\n", address[0], address[1], address[2], address[3]);
  print("Supports AI       = %s\n", true_or_false(edid.supports_ai != 0));
  print("Bits per pixel    = %s%s%s%s\n", edid.dc_48bit != 0 ? "48bits " : "", edid.dc_36bit != 0 ? "36bits " : "",
        edid.dc_30bit != 0 ? "30bits " : "", edid.dc_y444 != 0 ? "Y444 " : "");
  print("Supports Dual DVI = %s\n", true_or_false(edid.dvi_dual != 0));
  print("Max TMDS Clock    = %d\n", edid.max_tmds_clock);
  print("CNC0              = %d\n", edid.cnc0);
  print("CNC1              = %d\n", edid.cnc1);
  print("CNC2              = %d\n", edid.cnc2);
  print("CNC3              = %d\n", edid.cnc3);
  // kept: these two belong to the extension, but are printed with the HDMI block only.
  print("Underscan support = %s\n", true_or_false(edid.underscan != 0));
  print("Basic audio       = %s\n", true_or_false(edid.basic_audio != 0));
}

void print_long(const edid_t *edid, const char *title) {
  print("%s\n", title);
  if (edid->valid == 0) return;
  print_identity(*edid);
  print_features(*edid);
  print_standard_timings(edid);
  print_detailed_timings(edid);
  print_limits(*edid);
  print_video_and_audio(edid);
  if (edid->hdmi_present != 0) print_hdmi(*edid);
  if (edid->xvycc601 != 0 || edid->xvycc709 != 0) {
    print("Additional Colorimetry: %s%s\n", edid->xvycc601 != 0 ? "xvYCC601 " : "",
          edid->xvycc709 != 0 ? "xvYCC709 " : "");
  }
}

}  // namespace
}  // namespace edid_composer

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operation below is the namespace's API

u8 print_edid_struct(const edid_t *edid, u8 brief, const char *title) {
  if (edid == nullptr) {
    LOG_ERROR("\"edid\" parameter is NULL. edid:%s", address(edid).text);
    return 0;
  }
  const char *const heading = title == nullptr ? "" : title;
  if (brief != 0) {
    print_brief(edid, heading);
  } else {
    print_long(edid, heading);
  }
  return 1;
}

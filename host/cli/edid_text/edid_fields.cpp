#include "edid_text/edid_fields.h"

#include <cstdio>
#include <iterator>

#include "edid_text/edid_value_texts.h"
#include "edid_text/hdmi2_fields.h"
#include "edid_text/physical_address_text.h"
#include "text/hexadecimal.h"

namespace edid_cli {
namespace {

using values_t = std::vector<std::string>;

/// Single values, by their kind.
template <auto member>
values_t yes_or_no(const edid_records_t &records) {
  return {records.edid.*member != 0 ? "yes" : "no"};
}

template <auto member>
values_t number(const edid_records_t &records) {
  return {std::to_string(records.edid.*member)};
}

template <auto member>
values_t hexadecimal(const edid_records_t &records) {
  return {hex_number(records.edid.*member)};
}

template <auto member>
values_t quoted(const edid_records_t &records) {
  return {"\"" + std::string(records.edid.*member) + "\""};
}

template <auto member>
values_t milliseconds(const edid_records_t &records) {
  return {std::to_string(records.edid.*member) + " ms"};
}

template <auto x, auto y>
values_t chromaticity(const edid_records_t &records) {
  char text[32];
  std::snprintf(text, sizeof text, "%.4f, %.4f", records.edid.*x / 1024.0, records.edid.*y / 1024.0);
  return {text};
}

template <auto member, const char *(*name_of)(u32)>
values_t bit_names(const edid_records_t &records) {
  values_t names;
  for (u32 bit = 0x80; bit != 0; bit >>= 1) {
    if ((records.edid.*member & bit) != 0) {
      names.emplace_back(name_of(bit));
    }
  }
  return names;
}

/// A text, or a list of them.
template <auto text_of>
values_t texts(const edid_records_t &records) {
  return values_t{text_of(records.edid)};
}

constexpr edid_field_t fields[] = {
    {"EDID version", texts<version_text>},
    {"manufacturer", quoted<&edid_t::manufacturer>},
    {"product code", hexadecimal<&edid_t::product_code>},
    {"serial number", hexadecimal<&edid_t::serial_number>},
    {"week", number<&edid_t::week>},
    {"year", number<&edid_t::year>},
    {"monitor name", quoted<&edid_t::monitor_name>},
    {"serial text", quoted<&edid_t::serial_string>},
    {"data text", quoted<&edid_t::data_string>},
    {"digital", yes_or_no<&edid_t::digital>},
    {"width in cm", number<&edid_t::h_size_cm>},
    {"height in cm", number<&edid_t::v_size_cm>},
    {"gamma", texts<gamma_text>},
    {"stand-by", yes_or_no<&edid_t::standby>},
    {"suspend", yes_or_no<&edid_t::suspend>},
    {"active off", yes_or_no<&edid_t::active_off>},
    {"sRGB by default", yes_or_no<&edid_t::standard_colorspace>},
    {"first timing is preferred", yes_or_no<&edid_t::preferred_timing>},
    {"default GTF", yes_or_no<&edid_t::gtf>},
    {"red", chromaticity<&edid_t::red_x, &edid_t::red_y>},
    {"green", chromaticity<&edid_t::green_x, &edid_t::green_y>},
    {"blue", chromaticity<&edid_t::blue_x, &edid_t::blue_y>},
    {"white", chromaticity<&edid_t::white_x, &edid_t::white_y>},
    {"established timing", bit_names<&edid_t::est_timings_1, est_timing_1_string>},
    {"established timing II", bit_names<&edid_t::est_timings_2, est_timing_2_string>},
    {"manufacturer's timing", bit_names<&edid_t::man_timings, man_timing_string>},
    {"standard timing", texts<standard_timing_texts>},
    {"detailed timing", texts<detailed_timing_texts>},
    {"lowest vertical rate in Hz", number<&edid_t::min_v_rate>},
    {"highest vertical rate in Hz", number<&edid_t::max_v_rate>},
    {"lowest horizontal rate in kHz", number<&edid_t::min_h_rate>},
    {"highest horizontal rate in kHz", number<&edid_t::max_h_rate>},
    {"highest pixel clock in MHz", number<&edid_t::max_pixel_clock>},
    {"extension blocks", number<&edid_t::extension_count>},
    {"underscan", yes_or_no<&edid_t::underscan>},
    {"basic audio", yes_or_no<&edid_t::basic_audio>},
    {"YCbCr 4:4:4", yes_or_no<&edid_t::ycbcr_444>},
    {"YCbCr 4:2:2", yes_or_no<&edid_t::ycbcr_422>},
    {"video mode", texts<video_mode_texts>},
    {"audio format", texts<audio_format_texts>},
    {"speakers", texts<speaker_text>},
    {"HDMI", yes_or_no<&edid_t::hdmi_present>},
    {"physical address", [](const edid_records_t &records) { return values_t{physical_address_text(records.edid)}; }},
    {"ACP and ISRC packets", yes_or_no<&edid_t::supports_ai>},
    {"deep colour, 48 bits", yes_or_no<&edid_t::dc_48bit>},
    {"deep colour, 36 bits", yes_or_no<&edid_t::dc_36bit>},
    {"deep colour, 30 bits", yes_or_no<&edid_t::dc_30bit>},
    {"deep colour in YCbCr 4:4:4", yes_or_no<&edid_t::dc_y444>},
    {"dual-link DVI", yes_or_no<&edid_t::dvi_dual>},
    {"highest TMDS clock in MHz", number<&edid_t::max_tmds_clock>},
    {"content type graphics", yes_or_no<&edid_t::cnc0>},
    {"content type photo", yes_or_no<&edid_t::cnc1>},
    {"content type cinema", yes_or_no<&edid_t::cnc2>},
    {"content type game", yes_or_no<&edid_t::cnc3>},
    {"video latency", milliseconds<&edid_t::video_latency>},
    {"audio latency", milliseconds<&edid_t::audio_latency>},
    {"interlaced video latency", milliseconds<&edid_t::i_video_latency>},
    {"interlaced audio latency", milliseconds<&edid_t::i_audio_latency>},
    {"HDMI video fields", yes_or_no<&edid_t::hdmi_video_present>},
    {"mandatory 3D", yes_or_no<&edid_t::hdmi_3d_present>},
    {"image size code", number<&edid_t::image_size>},
    {"4Kx2K mode", texts<mode_4k_x_2k_texts>},
    {"xvYCC601", yes_or_no<&edid_t::xvycc601>},
    {"xvYCC709", yes_or_no<&edid_t::xvycc709>},
};

}  // namespace

const std::vector<edid_field_t> &edid_fields() {
  static const std::vector<edid_field_t> all = [] {
    std::vector<edid_field_t> both(std::begin(fields), std::end(fields));
    both.insert(both.end(), hdmi2_fields().begin(), hdmi2_fields().end());
    return both;
  }();
  return all;
}

}  // namespace edid_cli

#include "edid_text/mode_names.h"

#include <algorithm>
#include <cstdio>
#include <string_view>

#include "edid_text/cta_video_formats.h"

namespace edid_cli {
namespace {

constexpr u32 vic_of_1250_lines = 39;
constexpr u32 unused_vic = 0;

/// By HDMI_VIC, from 1 on.
constexpr u32 vics_of_hdmi_vics[last_hdmi_vic] = {95, 94, 93, 98};

/// What stands before "Hz", and the aspect ratio after it.
std::string_view before_hertz(std::string_view timing) {
  return timing.substr(0, timing.find("Hz"));
}

std::string aspect_after_hertz(std::string_view timing) {
  const std::size_t end = timing.find("Hz");
  std::string aspect(end == std::string_view::npos ? std::string_view() : timing.substr(end + 2));
  std::replace(aspect.begin(), aspect.end(), 'x', ':');
  return aspect.substr(0, aspect.find_last_not_of(' ') + 1);
}

u32 whole_hertz(u32 millihertz) {
  return (millihertz + 500) / 1000;
}

std::string raster_text(const cta_video_format_t &format) {
  return std::to_string(format.width) + "x" + std::to_string(format.lines) + "p" +
         std::to_string(whole_hertz(format.rate_mhz));
}

std::string library_raster_text(u32 vic) {
  // The library's name of this one runs its two heights together.
  return vic == vic_of_1250_lines ? "1920x1080i50" : std::string(before_hertz(short_video_timing_string(vic)));
}

bool is_of_library(u32 vic) {
  return vic > unused_vic && vic <= last_library_vic;
}

/// "1920x1080p60" or "720(1440)x480i60".
std::optional<raster_t> parsed_raster(const std::string &text) {
  raster_t raster;
  char scan = 0;
  const bool is_plain = std::sscanf(text.c_str(), "%ux%u%c%u", &raster.width, &raster.lines, &scan, &raster.rate) == 4;
  if (!is_plain && std::sscanf(text.c_str(), "%u(%u)x%u%c%u", &raster.width, &raster.doubled_width, &raster.lines,
                               &scan, &raster.rate) != 5) {
    return std::nullopt;
  }
  raster.interlaced = scan == 'i';
  return raster;
}

}  // namespace

std::uint64_t raster_t::pixel_rate() const {
  return std::uint64_t{width} * lines * rate / (interlaced ? 2 : 1);
}

std::optional<raster_t> raster_of_vic(u32 vic) {
  if (is_of_library(vic)) {
    return parsed_raster(library_raster_text(vic));
  }
  const cta_video_format_t *const format = find_cta_video_format(vic);
  return format != nullptr ? parsed_raster(raster_text(*format)) : std::nullopt;
}

std::optional<raster_t> raster_of_hdmi_vic(u32 hdmi_vic) {
  return hdmi_vic >= 1 && hdmi_vic <= last_hdmi_vic ? raster_of_vic(vics_of_hdmi_vics[hdmi_vic - 1]) : std::nullopt;
}

u32 vic_of(const short_video_desc_t &descriptor) {
  constexpr u32 native_bit = 0x80;
  const u32 later = descriptor.vic | native_bit;
  return descriptor.native != 0 && find_cta_video_format(later) != nullptr ? later : descriptor.vic;
}

svd_t decoded_svd(u32 code) {
  constexpr u32 vic_bits = 0x7F;
  const bool has_native_bit = ((code - 1) & 0x40) == 0 || (code & vic_bits) == 0;
  return has_native_bit ? svd_t{code & vic_bits, code > vic_bits} : svd_t{code, false};
}

u32 pixel_clock_of_vic(u32 vic) {
  const cta_video_format_t *const format = find_cta_video_format(vic);
  return format != nullptr ? format->pixel_clock_khz : 0;
}

std::string short_mode_name(u32 vic) {
  const cta_video_format_t *const format = find_cta_video_format(vic);
  return is_of_library(vic)  ? library_raster_text(vic)
         : format != nullptr ? raster_text(*format)
                             : "VIC " + std::to_string(vic);
}

std::string video_mode_name(u32 vic) {
  const std::string number = "VIC " + std::to_string(vic);
  const cta_video_format_t *const format = find_cta_video_format(vic);
  const std::string aspect = is_of_library(vic)  ? aspect_after_hertz(short_video_timing_string(vic))
                             : format != nullptr ? format->aspect
                                                 : "";
  return aspect.empty() ? number : short_mode_name(vic) + " " + aspect + " (" + number + ")";
}

u32 hdmi_vic_of_vic(u32 vic) {
  const auto *const found = std::find(std::begin(vics_of_hdmi_vics), std::end(vics_of_hdmi_vics), vic);
  return found != std::end(vics_of_hdmi_vics) ? static_cast<u32>(found - std::begin(vics_of_hdmi_vics)) + 1 : 0;
}

std::string mode_4k_name(u32 hdmi_vic) {
  const std::string number = "4k:" + std::to_string(hdmi_vic);
  return hdmi_vic >= 1 && hdmi_vic <= last_hdmi_vic
             ? std::string(before_hertz(hdmi_vic_string(hdmi_vic))) + " (" + number + ")"
             : number;
}

std::string audio_type_name(u32 type) {
  return type == 0 ? "unknown format" : short_audio_string(type);
}

std::string channels_name(u32 channels) {
  return std::to_string(channels) + (channels == 1 ? " channel" : " channels");
}

std::string raster_name(i32 width, i32 lines, i32 refresh, bool interlaced) {
  if (lines == 0) {
    return std::to_string(width) + " pixels wide at " + std::to_string(refresh) + " Hz";
  }
  return std::to_string(width) + "x" + std::to_string(lines) + (interlaced ? "i" : "p") + std::to_string(refresh);
}

}  // namespace edid_cli

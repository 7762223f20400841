#include "explain/mode_names.h"

#include <algorithm>
#include <iterator>

#include "text/lower_case.h"

namespace edid_cli {
namespace {

constexpr u32 vic_of_1250_lines = 39;
constexpr std::string_view doubled_pixels = "(1440)";

struct audio_name_t {
  std::string_view name;
  u32 type;
};

constexpr audio_name_t audio_names[] = {
    {"pcm", 1},       {"lpcm", 1},           {"ac3", 2},     {"ac-3", 2},    {"mpeg1", 3},    {"mpeg-1", 3},
    {"mp3", 4},       {"mpeg2", 5},          {"mpeg-2", 5},  {"aac", 6},     {"dts", 7},      {"atrac", 8},
    {"dsd", 9},       {"eac3", 10},          {"e-ac-3", 10}, {"dd+", 10},    {"dts-hd", 11},  {"dtshd", 11},
    {"mlp", 12},      {"truehd", 12},        {"dst", 13},    {"wmapro", 14}, {"wma-pro", 14}, {"he-aac", 16},
    {"he-aacv2", 17}, {"mpeg-surround", 18},
};

/// What stands before "Hz", and the aspect ratio behind it.
std::string_view raster_of(std::string_view timing) {
  return timing.substr(0, timing.find("Hz"));
}

std::string vic_raster(u32 vic) {
  // The library's name of this one runs its two heights together.
  return vic == vic_of_1250_lines ? "1920x1080i50" : std::string(raster_of(short_video_timing_string(vic)));
}

std::string aspect_of(std::string_view timing) {
  const std::size_t end = timing.find("Hz");
  std::string aspect(end == std::string_view::npos ? std::string_view() : timing.substr(end + 2));
  std::replace(aspect.begin(), aspect.end(), 'x', ':');
  return aspect.substr(0, aspect.find_last_not_of(' ') + 1);
}

/// "720(1440)x480i60" may be asked for as "720x480i60" and as "1440x480i60".
bool is_called(const std::string &raster, std::string_view name) {
  const std::size_t doubled = raster.find(doubled_pixels);
  if (doubled == std::string::npos) {
    return raster == name;
  }
  const std::string rest = raster.substr(doubled + doubled_pixels.size());
  return raster == name || raster.substr(0, doubled) + rest == name || "1440" + rest == name;
}

}  // namespace

std::string short_mode_name(u32 vic) {
  return vic >= 1 && vic <= last_vic ? vic_raster(vic) : "VIC " + std::to_string(vic);
}

std::string video_mode_name(u32 vic) {
  if (vic < 1 || vic > last_vic) {
    return "VIC " + std::to_string(vic);
  }
  return vic_raster(vic) + " " + aspect_of(short_video_timing_string(vic)) + " (VIC " + std::to_string(vic) + ")";
}

std::string mode_4k_name(u32 hdmi_vic) {
  const std::string number = "4k:" + std::to_string(hdmi_vic);
  return hdmi_vic >= 1 && hdmi_vic <= last_hdmi_vic
             ? std::string(raster_of(hdmi_vic_string(hdmi_vic))) + " (" + number + ")"
             : number;
}

std::string audio_type_name(u32 type) {
  return type == 0 ? "unknown format" : short_audio_string(type);
}

std::string raster_name(i32 width, i32 lines, i32 refresh, bool interlaced) {
  if (lines == 0) {
    return std::to_string(width) + " pixels wide at " + std::to_string(refresh) + " Hz";
  }
  return std::to_string(width) + "x" + std::to_string(lines) + (interlaced ? "i" : "p") + std::to_string(refresh);
}

std::vector<u32> vics_of_mode(std::string_view name) {
  std::vector<u32> vics;
  for (u32 vic = 1; vic <= last_vic; ++vic) {
    if (is_called(vic_raster(vic), name)) {
      vics.push_back(vic);
    }
  }
  return vics;
}

std::vector<u32> hdmi_vics_of_mode(std::string_view name) {
  std::vector<u32> vics;
  for (u32 vic = 1; vic <= last_hdmi_vic; ++vic) {
    if (raster_of(hdmi_vic_string(vic)) == name) {
      vics.push_back(vic);
    }
  }
  return vics;
}

u32 audio_type_of(std::string_view name) {
  const std::string lower = lower_case(name);
  const auto *const found = std::find_if(std::begin(audio_names), std::end(audio_names),
                                         [&lower](const audio_name_t &entry) { return entry.name == lower; });
  return found != std::end(audio_names) ? found->type : 0;
}

}  // namespace edid_cli

#include "explain/wanted.h"

#include <algorithm>
#include <array>
#include <cctype>
#include <cstdio>
#include <iterator>
#include <optional>

#include "edid_text/mode_names.h"
#include "explain/hdmi2_features.h"
#include "io/bad_input.h"
#include "text/lower_case.h"
#include "text/whole_number.h"

namespace edid_cli {
namespace {

constexpr std::string_view prefix_4k = "4k:";
constexpr std::string_view prefix_audio = "audio:";
constexpr std::string_view prefix_vic = "vic";
constexpr u32 extension_type = 15;
constexpr u32 most_channels = 8;

struct code_name_t {
  std::string_view name;
  u32 code;
};

constexpr code_name_t audio_names[] = {
    {"pcm", 1},
    {"lpcm", 1},
    {"ac3", 2},
    {"ac-3", 2},
    {"dd", 2},
    {"mpeg1", 3},
    {"mpeg-1", 3},
    {"mp3", 4},
    {"mpeg2", 5},
    {"mpeg-2", 5},
    {"aac", 6},
    {"dts", 7},
    {"atrac", 8},
    {"dsd", 9},
    {"eac3", 10},
    {"e-ac-3", 10},
    {"e-ac3", 10},
    {"ddp", 10},
    {"dd+", 10},
    {"dts-hd", 11},
    {"dtshd", 11},
    {"mlp", 12},
    {"truehd", 12},
    {"dst", 13},
    {"wmapro", 14},
    {"wma-pro", 14},
    {"he-aac", 16},
    {"he-aacv2", 17},
    {"mpeg-surround", 18},
};

/// Loudspeakers as people count them.
constexpr code_name_t channel_names[] = {{"2.0", 2}, {"2.1", 3}, {"5.1", 6}, {"7.1", 8}};

constexpr code_name_t depth_names[] = {
    {"deep-color", 36}, {"deep-colour", 36}, {"deepcolor", 36}, {"30bit", 30}, {"36bit", 36}, {"48bit", 48},
};

struct feature_name_t {
  std::string_view name;
  wanted_t wanted;
};

/// What HDMI 2 added besides modes.
constexpr feature_name_t feature_names[] = {
    {"hdr", {COMPOSE_SUBJECT_HDR, HDMI2_EOTF_PQ}},
    {"hdr10", {COMPOSE_SUBJECT_HDR, HDMI2_EOTF_PQ}},
    {"hlg", {COMPOSE_SUBJECT_HDR, HDMI2_EOTF_HLG}},
    {"hdr10+", {COMPOSE_SUBJECT_PASSED_BLOCK, COMPOSE_ROOM_HDR10PLUS}},
    {"hdr10plus", {COMPOSE_SUBJECT_PASSED_BLOCK, COMPOSE_ROOM_HDR10PLUS}},
    {"dolby-vision", {COMPOSE_SUBJECT_PASSED_BLOCK, COMPOSE_ROOM_DOLBY_VISION}},
    {"dolbyvision", {COMPOSE_SUBJECT_PASSED_BLOCK, COMPOSE_ROOM_DOLBY_VISION}},
    {"freesync", {COMPOSE_SUBJECT_PASSED_BLOCK, COMPOSE_ROOM_FREESYNC}},
    {"bt2020", {COMPOSE_SUBJECT_COLORIMETRY, HDMI2_BT2020_YCC}},
    {"4:2:0", {COMPOSE_SUBJECT_YCBCR_420, 1}},
    {"420", {COMPOSE_SUBJECT_YCBCR_420, 1}},
    {"allm", {COMPOSE_SUBJECT_ALLM, 1}},
    {"vrr", {COMPOSE_SUBJECT_VRR, 1}},
};

struct line_width_t {
  u32 lines;
  u32 width;
};

/// The modes that are meant where only lines are named.
constexpr line_width_t usual_widths[] = {{480, 720}, {576, 720}, {720, 1280}, {1080, 1920}, {2160, 3840}, {4320, 7680}};

/// Without blanks, in small letters.
std::string plain(std::string_view text) {
  std::string result = lower_case(text);
  std::erase(result, ' ');
  return result;
}

/// The number after a prefix, from 1 to @p last; 0 for anything else.
u32 number_in(std::string_view text, u32 last) {
  const auto number = parse_whole_number(text);
  return number && *number <= last ? *number : 0;
}

template <std::size_t size>
u32 code_of(std::string_view name, const code_name_t (&names)[size]) {
  const auto *const found =
      std::find_if(std::begin(names), std::end(names), [name](const auto &entry) { return entry.name == name; });
  return found != std::end(names) ? found->code : 0;
}

/// A rate as people write it: 59.94 and 59 are 60.
std::optional<u32> parsed_rate(std::string_view text) {
  constexpr u32 counted_down[] = {23, 29, 47, 59, 119, 239};
  const auto rate = parse_whole_number(text.substr(0, text.find('.')));
  if (!rate) {
    return std::nullopt;
  }
  const bool is_down = std::find(std::begin(counted_down), std::end(counted_down), *rate) != std::end(counted_down);
  return *rate + (is_down ? 1 : 0);
}

/// "1920x1080p60", "1080p60", "4k60" or "8k30"; a width of 0 where the usual one is meant.
std::optional<raster_t> parsed_mode(std::string_view text) {
  raster_t mode;
  const std::size_t scan = text.find_first_of("pi");
  const bool is_4k = text.starts_with("4k");
  if (is_4k || text.starts_with("8k")) {
    mode.lines = is_4k ? 2160 : 4320;
    text.remove_prefix(text.substr(2).starts_with('p') ? 3 : 2);
  } else if (scan != std::string_view::npos) {
    std::string_view size = text.substr(0, scan);
    if (const std::size_t cross = size.find('x'); cross != std::string_view::npos) {
      mode.width = number_in(size.substr(0, cross), 0xFFFF);
      if (mode.width == 0) {
        return std::nullopt;
      }
      size.remove_prefix(cross + 1);
    }
    mode.lines = number_in(size, 0xFFFF);
    mode.interlaced = text[scan] == 'i';
    text.remove_prefix(scan + 1);
  }
  const auto rate = parsed_rate(text);
  if (mode.lines == 0 || !rate) {
    return std::nullopt;
  }
  mode.rate = *rate;
  if (mode.width == 0) {
    for (const line_width_t &usual : usual_widths) {
      mode.width = usual.lines == mode.lines ? usual.width : mode.width;
    }
  }
  return mode;
}

bool is_called(const raster_t &mode, const raster_t &wanted) {
  return (mode.width == wanted.width || (mode.doubled_width != 0 && mode.doubled_width == wanted.width)) &&
         mode.lines == wanted.lines && mode.interlaced == wanted.interlaced && mode.rate == wanted.rate;
}

compose_subject subject_of_vic(u32 vic) {
  return vic > last_library_vic ? COMPOSE_SUBJECT_EXTENDED_MODE : COMPOSE_SUBJECT_VIDEO_MODE;
}

/// What the library can offer of a raster; only where that is nothing, the first VIC that a sink might list.
std::vector<wanted_t> modes_called(const raster_t &wanted) {
  std::vector<wanted_t> modes;
  for (u32 hdmi_vic = 1; hdmi_vic <= last_hdmi_vic; ++hdmi_vic) {
    if (is_called(*raster_of_hdmi_vic(hdmi_vic), wanted)) {
      modes.push_back({COMPOSE_SUBJECT_4K_MODE, hdmi_vic});
    }
  }
  for (u32 vic = 1; vic <= last_vic; ++vic) {
    const auto raster = raster_of_vic(vic);
    if (raster && is_called(*raster, wanted) && (vic <= last_library_vic || modes.empty())) {
      modes.push_back({subject_of_vic(vic), vic});
    }
  }
  return modes;
}

/// A VIC that HDMI 1.4 has another number for is asked for by that.
wanted_t wanted_vic(u32 vic) {
  const u32 hdmi_vic = hdmi_vic_of_vic(vic);
  return hdmi_vic != 0 ? wanted_t{COMPOSE_SUBJECT_4K_MODE, hdmi_vic} : wanted_t{subject_of_vic(vic), vic};
}

/// "ac3", "pcm8" or "pcm7.1".
std::optional<wanted_t> parsed_audio(std::string_view text) {
  if (const u32 type = code_of(text, audio_names)) {
    return wanted_t{COMPOSE_SUBJECT_AUDIO_FORMAT, type};
  }
  for (const code_name_t &channels : channel_names) {
    if (text.ends_with(channels.name)) {
      const u32 type = code_of(text.substr(0, text.size() - channels.name.size()), audio_names);
      return type != 0 ? std::optional(wanted_t{COMPOSE_SUBJECT_AUDIO_FORMAT, type, channels.code}) : std::nullopt;
    }
  }
  const u32 channels = text.empty() ? 0 : number_in(text.substr(text.size() - 1), most_channels);
  const u32 type = channels != 0 ? code_of(text.substr(0, text.size() - 1), audio_names) : 0;
  return type != 0 ? std::optional(wanted_t{COMPOSE_SUBJECT_AUDIO_FORMAT, type, channels}) : std::nullopt;
}

[[noreturn]] void refuse(std::string_view text, const std::string &expected) {
  throw bad_input_t("--want: \"" + std::string(text) + "\" is not " + expected);
}

/// The number after a prefix; refuses what @p is_known doesn't know.
u32 numbered(std::string_view text, std::string_view number, bool (*is_known)(u32 code), const char *expected) {
  const auto code = parse_whole_number(number);
  if (!code || !is_known(*code)) {
    refuse(text, expected);
  }
  return *code;
}

bool is_hdmi_vic(u32 code) {
  return code >= 1 && code <= last_hdmi_vic;
}

bool is_audio_type(u32 code) {
  return code >= 1 && code <= last_audio_type && code != extension_type;
}

bool is_vic(u32 code) {
  return raster_of_vic(code).has_value();
}

}  // namespace

std::vector<wanted_t> parse_wanted(std::string_view original) {
  const std::string text = plain(original);
  const std::string_view view = text;
  if (view.starts_with(prefix_4k)) {
    const u32 code = numbered(original, view.substr(prefix_4k.size()), is_hdmi_vic, "4k:1 to 4k:4");
    return {{COMPOSE_SUBJECT_4K_MODE, code}};
  }
  if (view.starts_with(prefix_audio)) {
    const u32 type = numbered(original, view.substr(prefix_audio.size()), is_audio_type,
                              "audio:1 to audio:14 or audio:16 to audio:18");
    return {{COMPOSE_SUBJECT_AUDIO_FORMAT, type}};
  }
  for (const feature_name_t &feature : feature_names) {
    if (feature.name == view) {
      return {feature.wanted};
    }
  }
  const bool is_prefixed = view.starts_with(prefix_vic);
  if (is_prefixed || parse_whole_number(view)) {
    const std::string_view number = is_prefixed ? view.substr(prefix_vic.size()) : view;
    return {wanted_vic(numbered(original, number, is_vic, "a VIC from 1 to 127 or from 193 to 219"))};
  }
  if (text == "3d") {
    return {{COMPOSE_SUBJECT_3D, 1}};
  }
  if (const u32 bits = code_of(view, depth_names)) {
    return {{COMPOSE_SUBJECT_DEEP_COLOR, bits}};
  }
  if (const auto audio = parsed_audio(view)) {
    return {*audio};
  }
  if (const auto mode = parsed_mode(view)) {
    if (auto modes = modes_called(*mode); !modes.empty()) {
      return modes;
    }
  }
  refuse(original,
         "a VIC such as 16, a mode such as 1080p60 or 4k30, a 4Kx2K mode such as 4k:1, an audio format such as ac3 or "
         "pcm8, 3d, deep-color, hdr10, hlg, 4:2:0, allm, vrr or dolby-vision");
}

std::string wanted_name(const wanted_t &wanted) {
  const std::string code = std::to_string(wanted.code);
  if (const hdmi2_feature_t *const feature = find_hdmi2_feature(wanted.subject, wanted.code)) {
    std::string name = feature->name;
    name.front() = static_cast<char>(std::toupper(static_cast<unsigned char>(name.front())));
    return name;
  }
  switch (wanted.subject) {
    case COMPOSE_SUBJECT_4K_MODE:
      return mode_4k_name(wanted.code);
    case COMPOSE_SUBJECT_AUDIO_FORMAT:
      return audio_type_name(wanted.code) + (wanted.channels != 0 ? " with " + channels_name(wanted.channels) : "") +
             " (audio:" + code + ")";
    case COMPOSE_SUBJECT_DEEP_COLOR:
      return "Deep colour with " + code + " bits";
    case COMPOSE_SUBJECT_3D:
      return "3D";
    default:
      return video_mode_name(wanted.code);
  }
}

}  // namespace edid_cli

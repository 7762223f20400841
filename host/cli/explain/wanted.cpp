#include "explain/wanted.h"

#include <string>

#include "explain/mode_names.h"
#include "io/bad_input.h"
#include "text/whole_number.h"

namespace edid_cli {
namespace {

constexpr std::string_view prefix_4k = "4k:";
constexpr std::string_view prefix_audio = "audio:";
constexpr u32 extension_type = 15;

std::vector<wanted_t> all_of(compose_subject subject, const std::vector<u32> &codes) {
  std::vector<wanted_t> wanted;
  for (const u32 code : codes) {
    wanted.push_back({subject, code});
  }
  return wanted;
}

/// The number after a prefix, from 1 to @p last; 0 for anything else.
u32 number_in(std::string_view text, u32 last) {
  const auto number = parse_whole_number(text);
  return number && *number <= last ? *number : 0;
}

[[noreturn]] void refuse(std::string_view text, const std::string &expected) {
  throw bad_input_t("--want: \"" + std::string(text) + "\" is not " + expected);
}

}  // namespace

std::vector<wanted_t> parse_wanted(std::string_view text) {
  if (text.starts_with(prefix_4k)) {
    const u32 code = number_in(text.substr(prefix_4k.size()), last_hdmi_vic);
    if (code == 0) {
      refuse(text, "4k:1 to 4k:4");
    }
    return all_of(COMPOSE_SUBJECT_4K_MODE, {code});
  }
  if (text.starts_with(prefix_audio)) {
    const u32 type = number_in(text.substr(prefix_audio.size()), last_audio_type);
    if (type == 0 || type == extension_type) {
      refuse(text, "audio:1 to audio:14 or audio:16 to audio:18");
    }
    return all_of(COMPOSE_SUBJECT_AUDIO_FORMAT, {type});
  }
  if (parse_whole_number(text)) {
    const u32 vic = number_in(text, last_vic);
    if (vic == 0) {
      refuse(text, "a VIC from 1 to 64");
    }
    return all_of(COMPOSE_SUBJECT_VIDEO_MODE, {vic});
  }
  if (const u32 type = audio_type_of(text)) {
    return all_of(COMPOSE_SUBJECT_AUDIO_FORMAT, {type});
  }
  if (const auto modes = hdmi_vics_of_mode(text); !modes.empty()) {
    return all_of(COMPOSE_SUBJECT_4K_MODE, modes);
  }
  if (const auto modes = vics_of_mode(text); !modes.empty()) {
    return all_of(COMPOSE_SUBJECT_VIDEO_MODE, modes);
  }
  refuse(text,
         "a VIC such as 16, a mode such as 1920x1080p60, a 4Kx2K mode such as 4k:1 or an audio format such as "
         "ac3 or audio:2");
}

}  // namespace edid_cli

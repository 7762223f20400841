#include "edid_text/edid_value_texts.h"

#include <algorithm>
#include <cstdio>
#include <iterator>
#include <string_view>

#include "edid_text/mode_names.h"
#include "edid_text/speaker_names.h"

namespace edid_cli {
namespace {

using texts_t = std::vector<std::string>;

/// One text for each entry of a list.
template <typename entry_t>
texts_t texts_of(const ll_list_t &list, std::string (*text_of)(const entry_t &entry)) {
  texts_t texts;
  for (const ll_entry_t *entry = list.head; entry != nullptr; entry = entry->next) {
    texts.push_back(text_of(*static_cast<const entry_t *>(entry->data)));
  }
  return texts;
}

struct bit_name_t {
  u32 bit;
  const char *name;
};

constexpr bit_name_t stereo_names[] = {
    {STEREO_FRAME_PACKING, "FP"},     {STEREO_SIDE_BY_SIDE_HALF, "SBSH"}, {STEREO_TOP_AND_BOTTOM, "TBH"},
    {STEREO_FIELD_ALTERNATIVE, "FA"}, {STEREO_LINE_ALTERNATIVE, "LA"},    {STEREO_SIDE_BY_SIDE_FULL, "SBSF"},
    {STEREO_L_DEPTH, "LD"},           {STEREO_L_DEPTH_GRAPHICS, "LDGD"},
};

/// The names of the bits that are set, with a blank before each.
template <std::size_t size>
std::string names_of(u32 bits, const bit_name_t (&names)[size]) {
  std::string text;
  for (const bit_name_t &name : names) {
    text += (bits & name.bit) != 0 ? std::string(" ") + name.name : "";
  }
  return text;
}

std::string without_blanks_at_end(const std::string &text) {
  return text.substr(0, text.find_last_not_of(' ') + 1);
}

std::string standard_timing_text(const std_timing_t &timing) {
  return std::to_string(timing.h_active) + "x" + std::to_string(standard_timing_lines(timing)) + "p" +
         std::to_string(timing.refresh_rate);
}

std::string detailed_timing_text(const detailed_timing_t &timing) {
  const u32 lines = timing.progressive != 0 ? timing.v_active : 2 * timing.v_active;
  const u32 refresh = calculate_refresh_rate(timing.pixel_clock, timing.h_active, timing.h_blanking, timing.v_active,
                                             timing.v_blanking);
  char text[256];
  std::snprintf(text, sizeof text, "%ux%u%c%u, %.2f MHz, h %u+%u+%u+%u%c, v %u+%u+%u+%u%c, border %u %u, %ux%u mm%s",
                timing.h_active, lines, timing.progressive != 0 ? 'p' : 'i', refresh, timing.pixel_clock / 1e6,
                timing.h_active, timing.h_sync_offset, timing.h_sync_width, timing.h_blanking,
                timing.h_sync_positive != 0 ? '+' : '-', timing.v_active, timing.v_sync_offset, timing.v_sync_width,
                timing.v_blanking, timing.v_sync_positive != 0 ? '+' : '-', static_cast<unsigned>(timing.h_border),
                static_cast<unsigned>(timing.v_border), timing.h_image_size, timing.v_image_size,
                timing.stereo != 0 ? ", stereo" : "");
  return text;
}

std::string video_mode_text(const short_video_desc_t &mode) {
  const u32 vic = vic_of(mode);
  const bool is_native = mode.native != 0 && vic == mode.vic;
  return video_mode_name(vic) + (is_native ? " native" : "") + names_of(mode.stereo, stereo_names);
}

}  // namespace

std::string audio_format_text(const short_audio_desc_t &format) {
  char rates[128] = "";
  audio_freq_string(format.frequencies, rates, sizeof rates);
  std::string text = short_audio_string(format.type);
  text += ", " + std::to_string(format.channels) + " channels, " + without_blanks_at_end(rates);
  if (format.pcm_bits != 0) {
    char sizes[64] = "";
    audio_pcm_bits_string(format.pcm_bits, sizes, sizeof sizes);
    text += ", " + without_blanks_at_end(sizes);
  }
  if (format.max_bitrate != 0) {
    text += ", " + std::to_string(format.max_bitrate) + " kbit/s";
  }
  if (format.value != 0) {
    text += ", value " + std::to_string(format.value);
  }
  if (format.wma_profile != 0) {
    text += ", profile " + std::to_string(format.wma_profile);
  }
  return text;
}

u32 standard_timing_lines(const std_timing_t &timing) {
  struct ratio_t {
    u32 width;
    u32 lines;
  };
  constexpr ratio_t ratios[] = {{16, 10}, {4, 3}, {5, 4}, {16, 9}};
  const ratio_t &ratio = ratios[timing.aspect_ratio & 3U];
  return timing.h_active * ratio.lines / ratio.width;
}

std::string version_text(const edid_t &edid) {
  return std::to_string(edid.version) + "." + std::to_string(edid.revision);
}

std::string gamma_text(const edid_t &edid) {
  char text[16];
  std::snprintf(text, sizeof text, "%.2f", (edid.gamma + 100) / 100.0);
  return text;
}

std::string speaker_text(const edid_t &edid) {
  const u32 speakers = edid.speaker[0] | static_cast<u32>(edid.speaker[1]) << 8;
  std::string names;
  for (const speaker_name_t &speaker : speaker_names) {
    names += (speakers & speaker.bit) == 0 ? "" : (names.empty() ? "" : " ") + std::string(speaker.abbreviation);
  }
  return names.empty() ? "-" : names;
}

texts_t standard_timing_texts(const edid_t &edid) {
  return texts_of(edid.std_timings, standard_timing_text);
}

texts_t detailed_timing_texts(const edid_t &edid) {
  return texts_of(edid.dtd_list, detailed_timing_text);
}

texts_t video_mode_texts(const edid_t &edid) {
  return texts_of(edid.video_list, video_mode_text);
}

texts_t audio_format_texts(const edid_t &edid) {
  return texts_of(edid.audio_list, audio_format_text);
}

texts_t mode_4k_x_2k_texts(const edid_t &edid) {
  texts_t texts;
  for (std::size_t index = 0; index < std::min<std::size_t>(edid.hdmi_vic_len, std::size(edid.hdmi_vic)); ++index) {
    texts.push_back(std::to_string(edid.hdmi_vic[index]) + " " + hdmi_vic_string(edid.hdmi_vic[index]));
  }
  return texts;
}

}  // namespace edid_cli

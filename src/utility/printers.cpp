// Descriptions of masks and descriptors in words.
#include <cstdio>
#include <cstring>
#include <iterator>

#include "diagnostics.h"
#include "output.h"

namespace edid_composer {
namespace {

struct bit_name_t {
  u32 bit;
  const char *name;
};

constexpr bit_name_t sample_rate_names[] = {
    {0x01, "32kHz "}, {0x02, "44.1kHz "},  {0x04, "48kHz "},  {0x08, "88.2kHz "},
    {0x10, "96kHz "}, {0x20, "176.4kHz "}, {0x40, "192kHz "},
};

constexpr bit_name_t sample_size_names[] = {{0x01, "16bits "}, {0x02, "20bits "}, {0x04, "24bits "}};

// Bytes 1 and 2 of the payload as one number (CEA-861, section 7.5.3).
constexpr bit_name_t speaker_names[] = {
    {0x001, "FL/FR"},    {0x002, " LFE"},     {0x004, " FC"},      {0x008, " RL/RR"},
    {0x010, " RC"},      {0x020, " FLC/FRC"}, {0x040, " RLC/RRC"}, {0x080, " FLW/FRW"},
    {0x100, " FLH/FRH"}, {0x200, " TC"},      {0x400, " FCH"},
};

constexpr bit_name_t stereo_names[] = {
    {STEREO_FRAME_PACKING, "FP "},     {STEREO_SIDE_BY_SIDE_HALF, "SSH "}, {STEREO_TOP_AND_BOTTOM, "TBH "},
    {STEREO_FIELD_ALTERNATIVE, "FA "}, {STEREO_LINE_ALTERNATIVE, "LA "},   {STEREO_SIDE_BY_SIDE_FULL, "SSF "},
    {STEREO_L_DEPTH, "LD "},           {STEREO_L_DEPTH_GRAPHICS, "LD+G "},
};

/// Appends the names of the set bits; what doesn't fit is cut. Returns the length of the whole text.
template <std::size_t count>
int join_names(const bit_name_t (&names)[count], u32 mask, char *string, u32 string_len) {
  std::size_t length = 0;
  for (const auto &row : names) {
    if ((mask & row.bit) == 0) continue;
    const std::size_t room = length < string_len ? string_len - length : 0;
    length += static_cast<std::size_t>(std::snprintf(room > 0 ? string + length : nullptr, room, "%s", row.name));
  }
  return static_cast<int>(length);
}

/// What both mask formatters do; @p unspecified stands for an empty mask.
template <const site_t &site, std::size_t count>
int mask_string(const bit_name_t (&names)[count], const char *unspecified, u32 mask, char *string, u32 string_len) {
  constexpr u32 minimum = 17;
  if (string == nullptr) {
    LOG_ERROR("\"string\" parameter is NULL. string:%s", address(string).text);
    return 0;
  }
  std::memset(string, 0, string_len);
  if (string_len < minimum) {
    LOG_ERROR("\"string_len\" invalid. string_len:%d minimum:%d", string_len, minimum);
    return 0;
  }
  if (mask == 0) return std::snprintf(string, string_len, "%s", unspecified);
  return join_names(names, mask, string, string_len);
}

}  // namespace
}  // namespace edid_composer

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operations below are the namespace's API

int audio_freq_string(u32 freq_mask, char *string, u32 string_len) {
  REPORTS_AS(audio_freq_string);
  return mask_string<site>(sample_rate_names, " NoFreqSpecified", freq_mask, string, string_len);
}

int audio_pcm_bits_string(u32 bits_mask, char *string, u32 string_len) {
  REPORTS_AS(audio_pcm_bits_string);
  return mask_string<site>(sample_size_names, " NoBitsSpecified", bits_mask, string, string_len);
}

void print_speaker(u8 byte1, u8 byte2, u8 byte3) {
  static_cast<void>(byte3);
  char speakers[200] = "";
  join_names(speaker_names, u32{byte1} | u32{byte2} << 8, speakers, sizeof speakers);
  print("%s\n", speakers);
}

void print_audio_structure(const short_audio_desc_t *audio) {
  REPORTS_AS(print_audio_structure);
  if (audio == nullptr) {
    LOG_ERROR("\"audio\" parameter is NULL. str:%s", address(audio).text);
    return;
  }
  char rates[100];
  audio_freq_string(audio->frequencies, rates, sizeof rates);
  const u32 type = audio->type;
  const char *const name = short_audio_string(type);
  char text[200];
  if (type == 1) {
    char sizes[30];
    audio_pcm_bits_string(audio->pcm_bits, sizes, sizeof sizes);
    std::snprintf(text, sizeof text, "Code:% 2d:%s Channels:%d Freq:%s Bits:%s", type, name, audio->channels, rates,
                  sizes);
  } else if (type >= 2 && type <= 8) {
    std::snprintf(text, sizeof text, "Code:% 2d:%s Channels:%d Freq:%s Max Rate:%dkHz", type, name, audio->channels,
                  rates, audio->max_bitrate);
  } else if (type >= 9 && type <= 13) {
    std::snprintf(text, sizeof text, "Code:% 2d:%s Channels:%d Freq:%s val:%d", type, name, audio->channels, rates,
                  audio->value);
  } else if (type == 14) {
    std::snprintf(text, sizeof text, "Code:% 2d:%s Channels:%d Freq:%s Max Profile:%d", type, name, audio->channels,
                  rates, audio->wma_profile);
  } else if (type >= 16 && type <= 18) {
    std::snprintf(text, sizeof text, "Code:% 2d:%s Channels:%d Freq:%s", type, name, audio->channels, rates);
  } else {
    std::snprintf(text, sizeof text, "Code:%d Unrecognized audio code.", type);
  }
  print("%s\n", text);
}

void print_stereo_type(u32 stereo_mask) {
  if (stereo_mask == 0) {
    print(" ");
    return;
  }
  for (const auto &row : stereo_names) {
    if ((stereo_mask & row.bit) != 0) print("%s", row.name);
  }
}

void print_est_man_type(u32 bits, const char *(*string_func)(u32), const char *str) {
  REPORTS_AS(print_est_man_type);
  if (string_func == nullptr) {
    LOG_BUG("string_func is:%s", address(nullptr).text);
    return;
  }
  if (str == nullptr || *str == '\0') {
    LOG_BUG("str ptr is NULL or 0 length:%s", address(str).text);
    return;
  }
  if (bits == 0) return;
  print("\n%s: 0x%04X\n", str, bits);
  for (u32 bit = 1U << 7; bit != 0; bit >>= 1) {
    if ((bits & bit) != 0) print("\t%s\n", string_func(bit));
  }
}

// What the tables of keys are written with.
#pragma once

#include <iterator>

#include "edid_composer/platform/configuration_keys.h"
#include "edid_composer/platform/configuration_list.h"

#define PATH(name) CONFIGURATION_DOMAIN name

namespace edid_composer {

struct limits_t {
  u32 minimum;
  u32 maximum;
  u32 default_number = 0;
};

/// @p path is the whole one; it ends with the name.
constexpr configuration_key_t key_of(configuration_kind kind, const char *path, const limits_t &limits,
                                     const char *meaning) {
  return {.size = sizeof(configuration_key_t),
          .kind = kind,
          .path = path,
          .name = path + sizeof CONFIGURATION_DOMAIN - 1,
          .minimum = limits.minimum,
          .maximum = limits.maximum,
          .default_number = limits.default_number,
          .default_text = "",
          .entry_characters = 0,
          .most_entries = 0,
          .meaning = meaning};
}

constexpr configuration_key_t integer(const char *path, const limits_t &limits, const char *meaning) {
  return key_of(CONFIGURATION_INTEGER, path, limits, meaning);
}

constexpr configuration_key_t unsigned_integer(const char *path, const limits_t &limits, const char *meaning) {
  return key_of(CONFIGURATION_UNSIGNED, path, limits, meaning);
}

constexpr configuration_key_t text(const char *path, const limits_t &characters, const char *default_text,
                                   const char *meaning) {
  configuration_key_t key = key_of(CONFIGURATION_TEXT, path, characters, meaning);
  key.default_text = default_text;
  return key;
}

constexpr configuration_key_t video_modes(const char *path, const char *meaning) {
  configuration_key_t key = key_of(CONFIGURATION_VIDEO_MODES, path, {1, 64}, meaning);
  key.entry_characters = entry_text_size - 2;
  return key;
}

constexpr configuration_key_t hdmi_vics(const char *path, const char *meaning) {
  configuration_key_t key = key_of(CONFIGURATION_HDMI_VICS, path, {1, 4}, meaning);
  key.most_entries = std::size(platform_values_t{}.modes_4k_x_2k_priority);
  return key;
}

constexpr configuration_key_t timing_bits(const char *path, const char *meaning) {
  return key_of(CONFIGURATION_TIMING_BITS, path, {0, 7}, meaning);
}

constexpr configuration_key_t standard_timings(const char *path, const char *meaning) {
  configuration_key_t key = key_of(CONFIGURATION_STANDARD_TIMINGS, path, {60, 123}, meaning);
  key.entry_characters = entry_text_size - 2;
  key.most_entries = 8;
  return key;
}

constexpr configuration_key_t audio_formats(const char *path, const char *meaning) {
  configuration_key_t key = key_of(CONFIGURATION_AUDIO_FORMATS, path, {0, 0xFFFFFF}, meaning);
  key.most_entries = 10;
  return key;
}

constexpr configuration_key_t extended_vics(const char *path, const char *meaning) {
  configuration_key_t key = key_of(CONFIGURATION_EXTENDED_VICS, path, {65, 219}, meaning);
  key.most_entries = HDMI2_MOST_LISTED_VICS;
  return key;
}

constexpr bool is_sound(const platform_key_t &row) {
  const configuration_key_t &key = row.key;
  const bool is_number = key.kind == CONFIGURATION_INTEGER || key.kind == CONFIGURATION_UNSIGNED;
  return key.minimum <= key.maximum &&
         (!is_number || (key.minimum <= key.default_number && key.default_number <= key.maximum));
}

}  // namespace edid_composer

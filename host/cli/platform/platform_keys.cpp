#include "platform/platform_keys.h"

namespace edid_cli {
namespace {

constexpr platform_key_t number(const char *name, std::int64_t min, std::int64_t max, std::int64_t default_number,
                                number_gap_t gap = {}) {
  return {.name = name,
          .kind = key_kind_t::signed_number,
          .min = min,
          .max = max,
          .default_number = default_number,
          .gap = gap};
}

/// Compared unsigned: a negative number is above the limit.
constexpr platform_key_t unsigned_number(const char *name, std::int64_t min, std::int64_t max,
                                         std::int64_t default_number, number_gap_t gap = {}) {
  platform_key_t key = number(name, min, max, default_number, gap);
  key.kind = key_kind_t::unsigned_number;
  return key;
}

constexpr platform_key_t text(const char *name, std::int64_t max, const char *default_text,
                              const char *short_effect = nullptr) {
  return {.name = name,
          .kind = key_kind_t::text,
          .min = short_effect == nullptr ? 0 : 2,
          .max = max,
          .default_text = default_text,
          .short_effect = short_effect};
}

constexpr platform_key_t mode_list(const char *name) {
  return {.name = name, .kind = key_kind_t::text_list, .min = 0, .max = 28, .may_be_empty = false};
}

constexpr platform_key_t number_list(const char *name, std::int64_t min, std::int64_t max,
                                     std::size_t most_entries = 0) {
  return {.name = name, .kind = key_kind_t::number_list, .min = min, .max = max, .most_entries = most_entries};
}

constexpr platform_key_t keys[] = {
    text("manufacturer_id", 3, "YYY"),
    unsigned_number("product_id", 0, 65535, 0),
    unsigned_number("serial", 0, 0xFFFFFFFF, 0),
    unsigned_number("week", 0, 255, 1, {54, 254, 53}),
    unsigned_number("year", 1990, 2100, 2012),
    text("monitor_name", 13, "", "without a name in the EDID, sources find no extension: neither HDMI nor audio"),
    text("monitor_serial", 13, ""),
    number("is_tv", 0, 1, 0),
    number("native_refresh_rate", 50, 60, 60, {51, 59, 60}),
    number("current_mode_set_to_priority", 0, 1, 0),
    number("geometry_limit", 0, 1, 0),
    number("native_bit", 0, 1, 1),
    number("underscan", 0, 1, 0),
    mode_list("60_hz_priority_list"),
    mode_list("60_hz_addition_list"),
    mode_list("50_hz_priority_list"),
    mode_list("50_hz_addition_list"),
    number_list("4k_x_2k_priority_list", 1, 4, 7),
    number_list("4k_x_2k_addition_list", 1, 4, 7),
    number_list("established_timings_1", 0, 7),
    number_list("established_timings_2", 0, 7),
    number_list("manufacturer_timings", 0, 7),
    {.name = "standard_timings", .kind = key_kind_t::text_list, .min = 0, .max = 28, .most_entries = 8},
    number("dc_30bit", 0, 1, 0),
    number("dc_36bit", 0, 1, 0),
    number("tmds_override", 0, 1275, 0),
    number("supports_ai", 0, 2, 0),
    unsigned_number("CNC0", 0, 2, 0),
    unsigned_number("CNC1", 0, 2, 0),
    unsigned_number("CNC2", 0, 2, 0),
    unsigned_number("CNC3", 0, 2, 0),
    number("xvYCC601", 0, 2, 0),
    number("xvYCC709", 0, 2, 0),
    number("speaker_entry", 1, 2047, 1),
    number("audio.pass_through", 0, 2, 0),
};

}  // namespace

std::span<const platform_key_t> platform_keys() {
  return keys;
}

std::string platform_path(const std::string &key) {
  return std::string(platform_domain) + "." + key;
}

std::vector<std::string> audio_entry_keys() {
  std::vector<std::string> entries;
  for (char letter = 'a'; letter <= 'z'; ++letter) {
    entries.push_back(std::string(audio_table) + "." + audio_entry_prefix + letter);
  }
  return entries;
}

}  // namespace edid_cli

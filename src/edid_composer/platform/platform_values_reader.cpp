#include "edid_composer/platform/platform_values_reader.h"

#include "diagnostics.h"
#include "edid_composer/platform/mode_lists.h"
#include "linked_list/typed_list.h"
#include "utility/configuration.h"

namespace edid_composer {
namespace {

REPORTS_AS(_read_platform_values);

/// A number of the configuration: its key, its limits, what it is when absent, where it goes.
template <typename number_t>
struct setting_t {
  const char *key;
  number_t min;
  number_t max;
  number_t default_val;
  number_t platform_values_t::*field;
};

constexpr setting_t<i32> refresh_rate_setting = {"native_refresh_rate", 50, 60, 60,
                                                 &platform_values_t::native_refresh_rate};

constexpr setting_t<i32> signed_settings[] = {
    {"current_mode_set_to_priority", 0, 1, 0, &platform_values_t::current_mode_set_to_priority},
    {"audio.pass_through", 0, 2, 0, &platform_values_t::audio_pass_through},
    {"underscan", 0, 1, 0, &platform_values_t::underscan},
    {"is_tv", 0, 1, 0, &platform_values_t::is_tv},
    {"geometry_limit", 0, 1, 0, &platform_values_t::geometry_limit},
    {"dc_30bit", 0, 1, 0, &platform_values_t::dc_30bit},
    {"dc_36bit", 0, 1, 0, &platform_values_t::dc_36bit},
    {"tmds_override", 0, 1275, 0, &platform_values_t::tmds_override},
    {"supports_ai", 0, 2, 0, &platform_values_t::supports_ai},
    {"speaker_entry", 1, 2047, 1, &platform_values_t::speaker_entry},
    {"xvYCC601", 0, 2, 0, &platform_values_t::xvYCC601},
    {"xvYCC709", 0, 2, 0, &platform_values_t::xvYCC709},
    {"native_bit", 0, 1, 1, &platform_values_t::native_bit},
};

constexpr setting_t<u32> unsigned_settings[] = {
    {"product_id", 0, 65535, 0, &platform_values_t::product_id},
    {"serial", 0, 0xFFFFFFFF, 0, &platform_values_t::serial},
    {"week", 0, 255, 1, &platform_values_t::week},
    {"year", 1990, 2100, 2012, &platform_values_t::year},
    {"CNC0", 0, 2, 0, &platform_values_t::cnc0},
    {"CNC1", 0, 2, 0, &platform_values_t::cnc1},
    {"CNC2", 0, 2, 0, &platform_values_t::cnc2},
    {"CNC3", 0, 2, 0, &platform_values_t::cnc3},
};

void read(const setting_t<i32> &setting, platform_values_t *values) {
  values->*setting.field = get_pc_int(setting.key, setting.min, setting.max, setting.default_val, true);
}

void read(const setting_t<u32> &setting, platform_values_t *values) {
  values->*setting.field = get_pc_uint(setting.key, setting.min, setting.max, setting.default_val, true);
}

void settle_refresh_rate(platform_values_t *values) {
  constexpr i32 fallback = 60;
  const i32 rate = values->native_refresh_rate;
  if (rate == 50 || rate == 60) return;
  LOG_WARNING(
      "Value in the platform config file for the domain \"%s\" is an unrecognized value:%d. Valid values: "
      "50,60. Using:%d",
      CONFIGURATION_DOMAIN "native_refresh_rate", rate, fallback);
  values->native_refresh_rate = fallback;
}

/// A year has at most 53 weeks; 255 marks the year as a model year (EDID 1.3, section 3.4).
void settle_week(platform_values_t *values) {
  constexpr u32 last_week = 53;
  constexpr u32 model_year = 255;
  if (values->week > last_week && values->week != model_year) values->week = last_week;
}

void read_settings(platform_values_t *values) {
  read(refresh_rate_setting, values);
  settle_refresh_rate(values);
  for (const auto &setting : signed_settings)
    read(setting, values);
  for (const auto &setting : unsigned_settings)
    read(setting, values);
  settle_week(values);
}

bool read_audio_entries(platform_values_t *values, entry_arena_t *arena) {
  appender_t<i32> entries(&values->audio_list, arena, site);
  char path[] = CONFIGURATION_DOMAIN "audio.entry_?";
  for (char letter = 'a'; letter <= 'z'; ++letter) {
    path[sizeof path - 2] = letter;
    i32 value = 0;
    if (config_get_int(0, path, &value) != 0) continue;
    if (!entries.append(value)) return false;
  }
  return true;
}

void read_mode_lists(platform_values_t *values, entry_arena_t *arena) {
  // An empty list has been reported by then, and is tolerated.
  _get_platform_list(list_50_priority, &values->video_50_priority, arena);
  _get_platform_list(list_50_additional, &values->video_50_additional, arena);
  _get_platform_list(list_60_priority, &values->video_60_priority, arena);
  _get_platform_list(list_60_additional, &values->video_60_additional, arena);
  _get_4k_x_2k_modes("4k_x_2k_priority_list", values->modes_4k_x_2k_priority);
  _get_4k_x_2k_modes("4k_x_2k_addition_list", values->modes_4k_x_2k_addition);
}

template <u32 size>
void read_text(const char *key, char (&field)[size], const char *default_val) {
  get_pc_str(key, field, size, default_val, true);
}

void read_texts(platform_values_t *values) {
  read_text("manufacturer_id", values->manufacturer_id, "YYY");
  read_text("monitor_name", values->monitor_name, "");
  read_text("monitor_serial", values->monitor_serial, "");
}

void read_timings(platform_values_t *values, entry_arena_t *arena) {
  _get_est_timing_list("established_timings_1", &values->established_timings_1);
  _get_est_timing_list("established_timings_2", &values->established_timings_2);
  _get_est_timing_list("manufacturer_timings", &values->manufacturer_timings);
  _get_std_timing_list(&values->std_timings, arena);
}

}  // namespace

bool _read_platform_values(platform_values_t *values, entry_arena_t *arena) {
  read_settings(values);
  if (!read_audio_entries(values, arena)) return false;
  read_mode_lists(values, arena);
  read_texts(values);
  read_timings(values, arena);
  return true;
}

}  // namespace edid_composer

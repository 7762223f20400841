#include "edid_composer/platform/mode_lists.h"

#include <iterator>

#include "diagnostics.h"
#include "edid_composer/platform/list_reading.h"
#include "edid_composer/platform/standard_timing_entry.h"
#include "edid_composer/platform/video_mode_entry.h"

namespace edid_composer {
namespace {

struct video_list_t {
  std::size_t field;
  u32 rate;
  const char *use;
};

/// By the numbers that reports give the lists.
constexpr video_list_t video_lists[] = {
    {offsetof(platform_values_t, video_50_priority), 50, "priority"},
    {offsetof(platform_values_t, video_60_priority), 60, "priority"},
    {offsetof(platform_values_t, video_50_additional), 50, "additional"},
    {offsetof(platform_values_t, video_60_additional), 60, "additional"},
};

u32 number_of_list(std::size_t field) {
  u32 number = 0;
  while (video_lists[number].field != field)
    ++number;
  return number;
}

bool is_within_limits(const configuration_entry_t &entry) {
  return entry.number >= static_cast<i32>(entry.key->minimum) && entry.number <= static_cast<i32>(entry.key->maximum);
}

struct modes_4k_x_2k_t {
  i32 (&modes)[7];
  u32 count;
};

/// Keeps one of the 4Kx2K modes, as long as there is room for it.
configuration_outcome_t _get_4k_x_2k_mode_callback(const configuration_entry_t &entry, modes_4k_x_2k_t *read) {
  REPORTS_AS(_get_4k_x_2k_mode_callback);
  if (!is_within_limits(entry)) {
    LOG_WARNING("Detected a 4k x 2k mode that is not supported. Max:%d Received:%d Node:%s", entry.key->maximum,
                entry.number, entry.node_name);
    return {.reason = CONFIGURATION_OUT_OF_RANGE, .found = entry.number};
  }
  if (read->count == std::size(read->modes)) return {.reason = CONFIGURATION_NO_ROOM, .found = entry.number};
  read->modes[read->count++] = entry.number;
  LOG_TRACE("Read 4k x 2k mode:%d", entry.number);
  return {.found = entry.number, .used = entry.number};
}

/// Sets the bit of a timing.
configuration_outcome_t _get_est_timing_callback(const configuration_entry_t &entry, u32 *mask) {
  REPORTS_AS(_get_est_timing_callback);
  if (!is_within_limits(entry)) {
    LOG_WARNING("Mode value is not 0 to 7. Val:%d Node:%s", entry.number, entry.node_name);
    return {.reason = CONFIGURATION_OUT_OF_RANGE, .found = entry.number};
  }
  *mask |= 1U << entry.number;
  LOG_TRACE("Added timing val:%d for list:%s", entry.number, entry.key->name);
  return {.found = entry.number, .used = entry.number};
}

}  // namespace

void _get_platform_list(const platform_key_t &row, ll_list_t *list, entry_arena_t *arena,
                        const configuration_readings_t &readings) {
  REPORTS_AS(_get_platform_list);
  const u32 number = number_of_list(row.field);
  LOG_TRACE("Reading %dHz %s list from platform config.", video_lists[number].rate, video_lists[number].use);
  appender_t<short_video_desc_t> modes = video_mode_appender(list, arena);
  read_list(row.key, readings, [&modes](const auto &entry) { return _get_vic_list_callback(entry, &modes); });
  if (ll_size(list) == 0) {
    LOG_ERROR(
        "A mode list (%d) is empty. Please verify that all of the video mode lists are properly populated with 3D mode "
        "formated strings.\n",
        number);
  }
}

void _get_4k_x_2k_modes(const configuration_key_t &key, i32 (&modes)[7], const configuration_readings_t &readings) {
  modes_4k_x_2k_t read{modes, 0};
  read_list(key, readings, [&read](const auto &entry) { return _get_4k_x_2k_mode_callback(entry, &read); });
}

void _get_est_timing_list(const configuration_key_t &key, u32 *mask, const configuration_readings_t &readings) {
  read_list(key, readings, [mask](const auto &entry) { return _get_est_timing_callback(entry, mask); });
}

void _get_std_timing_list(const configuration_key_t &key, ll_list_t *list, entry_arena_t *arena,
                          const configuration_readings_t &readings) {
  read_list(key, readings, [list, arena](const auto &entry) { return _get_std_timing_callback(entry, list, arena); });
}

}  // namespace edid_composer

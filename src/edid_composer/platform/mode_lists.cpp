#include "edid_composer/platform/mode_lists.h"

#include <iterator>

#include "diagnostics.h"
#include "edid_composer/platform/configuration_list.h"
#include "edid_composer/platform/standard_timing_entry.h"
#include "edid_composer/platform/video_mode_entry.h"

namespace edid_composer {
namespace {

struct video_list_t {
  u32 rate;
  const char *use;
  const char *name;
};

/// By platform_list_type.
constexpr video_list_t video_lists[] = {
    {50, "priority", "50_hz_priority_list"},
    {60, "priority", "60_hz_priority_list"},
    {50, "additional", "50_hz_addition_list"},
    {60, "additional", "60_hz_addition_list"},
};

struct modes_4k_x_2k_t {
  i32 (&modes)[7];
  u32 count;
};

/// Keeps one of the 4Kx2K modes, as long as there is room for it.
void _get_4k_x_2k_mode_callback(const configuration_entry_t &entry, modes_4k_x_2k_t *read) {
  REPORTS_AS(_get_4k_x_2k_mode_callback);
  constexpr i32 first_mode = 1;
  constexpr i32 last_mode = 4;
  if (entry.number < first_mode || entry.number > last_mode) {
    LOG_WARNING("Detected a 4k x 2k mode that is not supported. Max:%d Received:%d Node:%s", last_mode, entry.number,
                entry.node_name);
    return;
  }
  if (read->count == std::size(read->modes)) return;
  read->modes[read->count++] = entry.number;
  LOG_TRACE("Read 4k x 2k mode:%d", entry.number);
}

/// Sets the bit of a timing.
void _get_est_timing_callback(const configuration_entry_t &entry, u32 *mask) {
  REPORTS_AS(_get_est_timing_callback);
  constexpr i32 last_bit = 7;
  if (entry.number < 0 || entry.number > last_bit) {
    LOG_WARNING("Mode value is not 0 to 7. Val:%d Node:%s", entry.number, entry.node_name);
    return;
  }
  *mask |= 1U << entry.number;
  LOG_TRACE("Added timing val:%d for list:%s", entry.number, entry.list_name);
}

}  // namespace

void _get_platform_list(platform_list_type type, ll_list_t *list, entry_arena_t *arena) {
  REPORTS_AS(_get_platform_list);
  const video_list_t &row = video_lists[type];
  LOG_TRACE("Reading %dHz %s list from platform config.", row.rate, row.use);
  appender_t<short_video_desc_t> modes = video_mode_appender(list, arena);
  for (const configuration_entry_t &entry : _get_generic_platform_list(row.name, entry_kind_t::text))
    _get_vic_list_callback(entry, &modes);
  if (ll_size(list) == 0) {
    LOG_ERROR(
        "A mode list (%d) is empty. Please verify that all of the video mode lists are properly populated with 3D mode "
        "formated strings.\n",
        type);
  }
}

void _get_4k_x_2k_modes(const char *list_name, i32 (&modes)[7]) {
  modes_4k_x_2k_t read{modes, 0};
  for (const configuration_entry_t &entry : _get_generic_platform_list(list_name, entry_kind_t::number))
    _get_4k_x_2k_mode_callback(entry, &read);
}

void _get_est_timing_list(const char *list_name, u32 *mask) {
  for (const configuration_entry_t &entry : _get_generic_platform_list(list_name, entry_kind_t::number))
    _get_est_timing_callback(entry, mask);
}

void _get_std_timing_list(ll_list_t *list, entry_arena_t *arena) {
  for (const configuration_entry_t &entry : _get_generic_platform_list("standard_timings", entry_kind_t::text))
    _get_std_timing_callback(entry, list, arena);
}

}  // namespace edid_composer

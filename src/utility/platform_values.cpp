#include <cstring>

#include "diagnostics.h"
#include "linked_list/element_types.h"

namespace edid_composer {
namespace {

/// The six lists of a record, in the order in which they are initialised and deleted.
struct platform_list_t {
  ll_list_t platform_values_t::*list;
  const char *element_type;
  const char *initialisation_failed;
  const char *deletion_failed;
};

constexpr platform_list_t platform_lists[] = {
    {&platform_values_t::audio_list, element_type_name<i32>, "Failed to initialize the platform values audio_list",
     "Failed removing platform audio_list"},
    {&platform_values_t::video_50_priority, element_type_name<short_video_desc_t>,
     "Failed to initialize the platform values video_50_priority", "Failed removing platform video_50_priority"},
    {&platform_values_t::video_50_additional, element_type_name<short_video_desc_t>,
     "Failed to initialize the platform values video_50_additional", "Failed removing platform video_50_additional"},
    {&platform_values_t::video_60_priority, element_type_name<short_video_desc_t>,
     "Failed to initialize the platform values video_60_priority", "Failed removing platform video_60_priority"},
    {&platform_values_t::video_60_additional, element_type_name<short_video_desc_t>,
     "Failed to initialize the platform values video_60_additional", "Failed removing platform video_60_additional"},
    {&platform_values_t::std_timings, element_type_name<std_timing_t>,
     "Failed to initialize the platform values standard timings", "Failed removing platform values standard timings"},
};

}  // namespace
}  // namespace edid_composer

using edid_composer::address;
using edid_composer::platform_lists;

bool platform_values_init(platform_values_t *values) {
  if (values == nullptr) {
    LOG_ERROR("\"values\" parameter is NULL. values:%p", address(values));
    return false;
  }
  std::memset(values, 0, sizeof *values);
  for (const auto &row : platform_lists) {
    if (!ll_init(&(values->*row.list), row.element_type)) {
      LOG_BUG("%s", row.initialisation_failed);
      return false;
    }
  }
  return true;
}

bool platform_values_destroy(platform_values_t *values) {
  if (values == nullptr) {
    LOG_ERROR("\"values\" parameter is NULL. values:%p", address(values));
    return false;
  }
  for (const auto &row : platform_lists) {
    if (!ll_delete_list(&(values->*row.list))) {
      LOG_BUG("%s", row.deletion_failed);
      return false;
    }
  }
  return true;
}

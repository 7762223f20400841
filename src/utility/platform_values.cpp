#include <cstring>

#include "diagnostics.h"
#include "linked_list/typed_list.h"

namespace edid_composer {
namespace {

/// The six lists of a record, in the order in which they are initialised and deleted, and their names in reports.
struct platform_list_t {
  ll_list_t platform_values_t::*list;
  u32 element_tag;
  const char *initialised_name;
  const char *removed_name;
};

constexpr platform_list_t platform_lists[] = {
    {&platform_values_t::audio_list, element_tag<i32>, "audio_list", "audio_list"},
    {&platform_values_t::video_50_priority, element_tag<short_video_desc_t>, "video_50_priority", "video_50_priority"},
    {&platform_values_t::video_50_additional, element_tag<short_video_desc_t>, "video_50_additional",
     "video_50_additional"},
    {&platform_values_t::video_60_priority, element_tag<short_video_desc_t>, "video_60_priority", "video_60_priority"},
    {&platform_values_t::video_60_additional, element_tag<short_video_desc_t>, "video_60_additional",
     "video_60_additional"},
    {&platform_values_t::std_timings, element_tag<std_timing_t>, "standard timings", "values standard timings"},
};

}  // namespace
}  // namespace edid_composer

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operations below are the namespace's API

bool platform_values_init(platform_values_t *values) {
  REPORTS_AS(platform_values_init);
  if (values == nullptr) {
    LOG_ERROR("\"values\" parameter is NULL. values:%s", address(values).text);
    return false;
  }
  std::memset(values, 0, sizeof *values);
  for (const auto &row : platform_lists) {
    // GCOVR_EXCL_START: takes a list at one of the few addresses whose magic is 0.
    if (!init_list(&(values->*row.list), row.element_tag)) {
      LOG_BUG("Failed to initialize the platform values %s", row.initialised_name);
      return false;
    }
    // GCOVR_EXCL_STOP
  }
  return true;
}

bool platform_values_destroy(platform_values_t *values) {
  REPORTS_AS(platform_values_destroy);
  if (values == nullptr) {
    LOG_ERROR("\"values\" parameter is NULL. values:%s", address(values).text);
    return false;
  }
  for (const auto &row : platform_lists) {
    if (!ll_delete_list(&(values->*row.list))) {
      LOG_BUG("Failed removing platform %s", row.removed_name);
      return false;
    }
  }
  return true;
}

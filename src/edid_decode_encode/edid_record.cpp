#include <cstring>

#include "diagnostics.h"
#include "linked_list/element_types.h"

namespace edid_composer {
namespace {

/// The four lists of a record, in the order in which they are checked, initialised and deleted.
/// kept: two lists are called otherwise when they are missing at destruction.
struct record_list_t {
  ll_list_t edid_t::*list;
  const char *element_type;
  const char *already_initialised;
  const char *not_initialised;
  const char *deletion_failed;
  const char *still_initialised;
};

constexpr record_list_t record_lists[] = {
    {&edid_t::std_timings, element_type_name<std_timing_t>, "standard_timing_list has already been initialized.",
     "List is not initialized. List:standard_timing_list.", "Failed deleting list: standard_timing_list.",
     "Deleted list believes it is still initialized: standard_timing_list."},
    {&edid_t::dtd_list, element_type_name<detailed_timing_t>, "detailed_timing_list has already been initialized.",
     "List is not initialized. List:detailed_timing_list.", "Failed deleting list: detailed_timing_list.",
     "Deleted list believes it is still initialized: detailed_timing_list."},
    {&edid_t::video_list, element_type_name<short_video_desc_t>,
     "short_video_description_list has already been initialized.",
     "List is not initialized. List:short_video_description_timing_list.",
     "Failed deleting list: short_video_description_list.",
     "Deleted list believes it is still initialized: short_video_description_list."},
    {&edid_t::audio_list, element_type_name<short_audio_desc_t>,
     "short_audio_description_list has already been initialized.",
     "List is not initialized. List:short_audio_description_timing_list.",
     "Failed deleting list: short_audio_description_list.",
     "Deleted list believes it is still initialized: short_audio_description_list."},
};

}  // namespace
}  // namespace edid_composer

using edid_composer::record_lists;

u8 edid_prepare(edid_t *edid) {
  std::memset(edid, 0, sizeof *edid);
  for (const auto &row : record_lists) {
    if (ll_is_initialized(&(edid->*row.list))) {
      LOG_ERROR("%s", row.already_initialised);
      return 0;
    }
  }
  for (const auto &row : record_lists) {
    if (!ll_init(&(edid->*row.list), row.element_type)) {
      LOG_ERROR("Failed initailzing list.");
      return 0;
    }
  }
  edid->valid = 0;
  return 1;
}

u8 edid_destroy(edid_t *edid) {
  for (const auto &row : record_lists) {
    if (!ll_is_initialized(&(edid->*row.list))) {
      LOG_ERROR("%s", row.not_initialised);
      return 0;
    }
  }
  for (const auto &row : record_lists) {
    if (!ll_delete_list(&(edid->*row.list))) {
      LOG_ERROR("%s", row.deletion_failed);
      return 0;
    }
  }
  for (const auto &row : record_lists) {
    if (ll_is_initialized(&(edid->*row.list))) {
      LOG_BUG("%s%s", row.still_initialised, "");
    }
  }
  return 1;
}

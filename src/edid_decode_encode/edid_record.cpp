#include <cstring>

#include "diagnostics.h"
#include "edid_decode_encode/record_lists.h"

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operations below are the namespace's API

u8 edid_prepare(edid_t *edid) {
  REPORTS_AS(edid_prepare);
  std::memset(edid, 0, sizeof *edid);
  for (const auto &row : record_lists) {
    // GCOVR_EXCL_START: takes a list at one of the few addresses whose magic is 0.
    if (ll_is_initialized(&(edid->*row.list))) {
      LOG_ERROR("%s has already been initialized.", row.name);
      return 0;
    }
    // GCOVR_EXCL_STOP
  }
  for (const auto &row : record_lists)
    init_list(&(edid->*row.list), row.element_tag);
  edid->valid = 0;
  return 1;
}

u8 edid_destroy(edid_t *edid) {
  REPORTS_AS(edid_destroy);
  for (const auto &row : record_lists) {
    if (!ll_is_initialized(&(edid->*row.list))) {
      LOG_ERROR("List is not initialized. List:%s.", row.name_when_missing);
      return 0;
    }
  }
  for (const auto &row : record_lists) {
    if (!ll_delete_list(&(edid->*row.list))) {
      LOG_ERROR("Failed deleting list: %s.", row.name);
      return 0;
    }
  }
  return 1;
}

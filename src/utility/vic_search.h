// What the searches for the VIC of a sink's timing begin with.
#pragma once

#include "diagnostics.h"

namespace edid_composer {

/// Checks the arguments and clears the result, in the name of the operation that searches.
template <const site_t &site>
bool begin_search(const edid_t *edid, const void *timing, u32 *vic) {
  if (vic == nullptr) {
    LOG_ERROR("\"vic\" parameter is NULL. vic:%s", address(vic).text);
    return false;
  }
  *vic = 0;
  if (edid == nullptr) {
    LOG_ERROR("\"edid\" parameter is NULL. edid:%s", address(edid).text);
    return false;
  }
  if (timing == nullptr) {
    LOG_ERROR("\"timing\" parameter is NULL. timing:%s", address(timing).text);
    return false;
  }
  return true;
}

}  // namespace edid_composer

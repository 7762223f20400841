#include "utility/timing.h"

#include "diagnostics.h"

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operations below are the namespace's API

u8 convert_geo_to_ratio(u32 width, u32 height, u32 *ratio) {
  REPORTS_AS(convert_geo_to_ratio);
  if (ratio == nullptr) {
    LOG_ERROR("\"ratio\" parameter is NULL. ratio=%s", address(ratio).text);
    return 0;
  }
  for (u32 code = 0; code < std::size(aspect_ratios); ++code) {
    if (width * aspect_ratios[code].height / aspect_ratios[code].width == height) {
      *ratio = code;
      return 1;
    }
  }
  LOG_TRACE("Got a set of values that didn't match an aspect ratio. width=%d height=%d", width, height);
  return 0;
}

u32 calculate_refresh_rate(u32 pixel_clock, u32 h_active, u32 h_blanking, u32 v_active, u32 v_blanking) {
  const u32 line = h_active + h_blanking;
  const u32 lines = v_active + v_blanking;
  return line == 0 || lines == 0 ? 0 : pixel_clock / line / lines;
}

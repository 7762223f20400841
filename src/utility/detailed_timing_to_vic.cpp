// The VIC of a detailed timing.
#include "utility/timing.h"
#include "utility/timing_lines.h"
#include "utility/vic_search.h"
#include "utility/vic_timings.h"

namespace edid_composer {
namespace {

REPORTS_AS(convert_dtd_to_vic);

bool same_raster(const vic_timing_t &row, const detailed_timing_t &timing) {
  return row.pixel_clock == timing.pixel_clock && row.progressive == timing.progressive &&
         row.horizontal.active == timing.h_active && row.horizontal.blanking == timing.h_blanking &&
         row.vertical.active == timing.v_active;
}

/// The picture aspect ratio of a row, whose image size always has one.
u32 aspect_of(const vic_timing_t &row) {
  u32 ratio = 0;
  convert_geo_to_ratio(row.image_size.width, row.image_size.height, &ratio);
  return ratio;
}

/// The picture aspect ratio of a timing: that of its image size, else that of the monitor.
bool timing_aspect(const edid_t &edid, const detailed_timing_t &timing, u32 *ratio) {
  if (timing.v_image_size != 0 && timing.h_image_size != 0) {
    if (convert_geo_to_ratio(timing.h_image_size, timing.v_image_size, ratio) == 1) return true;
    LOG_TRACE("Unable to match timing size to an aspect ratio. H pixels:%d V pixels:%d", timing.h_image_size,
              timing.v_image_size);
    return false;
  }
  if (edid.v_size_cm == 0 || edid.h_size_cm == 0) {
    LOG_TRACE("Timings image size is zeroed as is the EDID monitor size. Unable to match to a timing.");
    return false;
  }
  if (convert_geo_to_ratio(edid.h_size_cm, edid.v_size_cm, ratio) == 1) return true;
  LOG_TRACE("Unable to match image size to an aspect ratio. H pixels:%d V pixels:%d", edid.h_size_cm, edid.v_size_cm);
  return false;
}

/// For a caller that traces.
void trace_unmatched(const detailed_timing_t &timing) {
  LOG_TRACE("Unable to match Detailed Timing Description.");
  for (const auto &line : timing_lines_t(timing))
    LOG_TRACE("%s", line);
}

}  // namespace
}  // namespace edid_composer

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operations below are the namespace's API

u8 convert_dtd_to_vic(const edid_t *edid, const detailed_timing_t *timing, u32 *vic) {
  if (!begin_search<site>(edid, timing, vic)) return 0;
  for (const vic_timing_t &row : g_vic_dtd) {
    u32 ratio = 0;
    if (same_raster(row, *timing) && timing_aspect(*edid, *timing, &ratio) && aspect_of(row) == ratio) {
      *vic = row.vic;
      return 1;
    }
  }
  if (is_tracing()) trace_unmatched(*timing);
  return 0;
}

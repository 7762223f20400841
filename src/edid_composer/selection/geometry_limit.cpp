#include "edid_composer/selection/geometry_limit.h"

#include <optional>

#include "linked_list/typed_list.h"
#include "utility/timing.h"

namespace edid_composer {
namespace {

/// The frame height of a VIC, in lines; nothing when it has no timing.
template <const site_t &site>
std::optional<u32> height_of(u32 vic) {
  detailed_timing_t timing{};
  if (convert_vic_to_dtd(vic, &timing) == 1) return frame_height(timing);
  LOG_BUG("\tFailed converting VIC:%d to a DTD.", vic);
  return std::nullopt;
}

}  // namespace

geometry_limit_t limit_geometry(const inputs_t &inputs, candidates_t *candidates, journal_t *journal) {
  if (inputs.platform.geometry_limit == 0) return {};
  const u32 limit = _find_largest_height(&inputs.sink.video_list);
  _remove_larger_height_modes(limit, candidates, journal);
  return {true, limit};
}

u32 _find_largest_height(const ll_list_t *video_list) {
  REPORTS_AS(_find_largest_height);
  u32 largest = 0;
  for (const auto &video : walk<const short_video_desc_t>(LIST(video_list, "video_list"))) {
    const std::optional<u32> height = height_of<site>(video.vic);
    if (height > largest) largest = *height;
  }
  LOG_TRACE("Largest Height:%d\n", largest);
  return largest;
}

void _remove_larger_height_modes(u32 limit, candidates_t *candidates, journal_t *journal) {
  REPORTS_AS(_remove_larger_height_modes);
  candidates->remove_if([&](u32 vic) {
    const std::optional<u32> height = height_of<site>(vic);
    if (!height || *height <= limit) return false;
    journal->note({.subject = COMPOSE_SUBJECT_VIDEO_MODE,
                   .code = vic,
                   .reason = COMPOSE_REASON_TALLER_THAN_SINK,
                   .values = reason_values(*height, limit)});
    return true;
  });
}

}  // namespace edid_composer

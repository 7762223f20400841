#include "edid_composer/new_edid/video_descriptors.h"

#include "edid_composer/new_edid/population.h"
#include "linked_list/typed_list.h"
#include "output.h"

namespace edid_composer {
namespace {

REPORTS_AS(_populate_new_edid);

}  // namespace

bool pad_video_modes(ll_list_t *modes, entry_arena_t *arena) {
  appender_t<short_video_desc_t> padding(modes, arena, site);
  for (auto size = static_cast<i32>(modes->size); size < fewest_modes; ++size) {
    LOG_ERROR(
        "The number of video formats to be encoded is less than 4! Padding until 4 is reached. Check the platform "
        "configuration file is correct. Number in the video list:%d",
        size);
    if (!padding.append({.native = 0, .vic = padding_vic, .stereo = 0})) return false;
  }
  return true;
}

bool add_detailed_timings(const ll_list_t &modes, ll_list_t *timings, entry_arena_t *arena) {
  constexpr i32 most = 2;
  appender_t<detailed_timing_t> added(timings, arena, site);
  for (const auto &mode : elements<const short_video_desc_t>(modes.head)) {
    if (timings->size == most) break;
    LOG_TRACE("\t\tVIC:%d %s", mode.vic, short_video_timing_string(mode.vic));
    detailed_timing_t timing{};
    if (convert_vic_to_dtd(mode.vic, &timing) != 1) {
      LOG_ERROR("Error converting vic to dtd. Vic:%d:%s", mode.vic, short_video_timing_string(mode.vic));
      return false;
    }
    if (!added.append(timing)) return false;
  }
  return true;
}

void trace_video_modes(const ll_list_t *video_list) {
  if (!is_tracing()) return;
  log_trace(site, __LINE__, "\tNew EDID List of VICs:");
  for (const auto &video : walk<const short_video_desc_t>(LIST(video_list, "video_list"))) {
    print("\t\tVIC:%d %s %s %s %s %s\n", video.vic, short_video_timing_string(video.vic),
          (video.stereo & STEREO_FRAME_PACKING) != 0 ? "FP" : "",
          (video.stereo & STEREO_SIDE_BY_SIDE_HALF) != 0 ? "SBSH" : "",
          (video.stereo & STEREO_TOP_AND_BOTTOM) != 0 ? "TBH" : "", video.native != 0 ? "Native" : "      ");
  }
  log_trace(site, __LINE__, "\tEncoding the video timings: Num:%d", video_list->size);
  log_trace(site, __LINE__, "\tCreating the first 2 DTDs.");
}

}  // namespace edid_composer

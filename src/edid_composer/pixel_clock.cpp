#include "diagnostics.h"
#include "edid_composer/population.h"
#include "linked_list/walk.h"

namespace edid_composer {
namespace {

/// How many times the pixels of the flat mode its most demanding 3D structures send.
u32 stereo_factor(u32 stereo) {
  constexpr u32 doubling = STEREO_FRAME_PACKING | STEREO_FIELD_ALTERNATIVE | STEREO_LINE_ALTERNATIVE |
                           STEREO_SIDE_BY_SIDE_FULL | STEREO_L_DEPTH;
  u32 factor = 1;
  if ((stereo & doubling) != 0) factor *= 2;
  if ((stereo & STEREO_L_DEPTH_GRAPHICS) != 0) factor *= 4;
  return factor;
}

}  // namespace

u32 _maximum_pixel_clock(const ll_list_t *vic_list) {
  if (ll_size(vic_list) == 0) {
    LOG_BUG("\tReceived a list that contains no entries. List:%p", address(vic_list));
    return 0;
  }
  u32 maximum = 0;
  for (const auto &video : walk<const short_video_desc_t>(LIST(vic_list))) {
    detailed_timing_t timing{};
    if (convert_vic_to_dtd(video.vic, &timing) != 1) {
      LOG_BUG("\tFailed converting VIC:%d to a DTD.", video.vic);
      continue;
    }
    const u32 clock = timing.pixel_clock * stereo_factor(video.stereo);
    if (clock > maximum) maximum = clock;
  }
  return maximum;
}

}  // namespace edid_composer

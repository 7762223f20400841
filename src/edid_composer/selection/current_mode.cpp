#include "edid_composer/selection/current_mode.h"

#include "edid_composer/selection/video_modes.h"
#include "linked_list/typed_list.h"

namespace edid_composer {
namespace {

REPORTS_AS(_filter_video_modes);

void delete_first(u32 vic, ll_list_t *modes) {
  bool deleted = false;
  unlink_elements<short_video_desc_t>(modes, 0, [&](i32, const short_video_desc_t &mode) {
    if (deleted || mode.vic != vic) return false;
    deleted = true;
    return true;
  });
}

bool put_first(u32 vic, ll_list_t *modes, entry_arena_t *arena) {
  delete_first(vic, modes);
  LOG_TRACE("\tAdding hdmi output mode as the priority mode:%s", short_video_timing_string(vic));
  return appender_t<short_video_desc_t>(modes, arena, site).prepend({.native = 0, .vic = vic, .stereo = 0});
}

}  // namespace

current_mode_t put_current_mode_first(const inputs_t &inputs, ll_list_t *modes) {
  const video_mode_t &mode = inputs.settings.hdmi_current_mode;
  const bool wanted = inputs.platform.current_mode_set_to_priority != 0;
  if (!wanted || !_valid_current_mode(mode)) {
    LOG_TRACE("\tIgnoring hdmi_current_mode.");
    return {true, wanted ? COMPOSE_REASON_CURRENT_MODE_IMPLAUSIBLE : COMPOSE_REASON_CURRENT_MODE_IGNORED, 0};
  }
  u32 vic = 0;
  if (mode_to_vic(&mode, &vic) != 1) {
    LOG_ERROR("Could not obtain a valid hdmi mode. Continuing.");
    return {true, COMPOSE_REASON_CURRENT_MODE_WITHOUT_VIC, 0};
  }
  return {put_first(vic, modes, inputs.arena), COMPOSE_REASON_CURRENT_MODE_FIRST, vic};
}

bool _valid_current_mode(const video_mode_t &mode) {
  constexpr auto within = [](u32 value, u32 min, u32 max) { return value >= min && value <= max; };
  return within(mode.height, 100, 8000) && within(mode.width, 400, 16000) && within(mode.refresh, 20, 1000) &&
         mode.interlaced <= 1;
}

}  // namespace edid_composer

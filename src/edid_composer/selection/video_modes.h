// Selection of the video modes that the new EDID offers.
#pragma once

#include "edid_composer/journal.h"
#include "edid_composer/selection/candidates.h"
#include "edid_composer/selection/current_mode.h"
#include "edid_composer/selection/geometry_limit.h"
#include "edid_composer/selection/native_rate.h"

namespace edid_composer {

struct video_selection_t {
  bool complete = false;  ///< False: a list could not be read or kept.
  native_rate_t native_rate{};
  geometry_limit_t geometry_limit{};
  current_mode_t current_mode{};
};

/// Appends to @p modes what the platform's priority list names and the sink or the addition list has, best first.
video_selection_t _filter_video_modes(const inputs_t &inputs, ll_list_t *modes, journal_t *journal);

/// Adds each entry of @p extra_list (VIC and 3D mask) to the candidates. @p of_sink says whose list it is.
bool _combine_lists(candidates_t *candidates, const ll_list_t *extra_list, bool of_sink);

}  // namespace edid_composer

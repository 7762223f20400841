// The mode that the platform puts out now, as first of the selection.
#pragma once

#include "edid_composer/inputs.h"

namespace edid_composer {

struct current_mode_t {
  bool complete = false;  ///< False: a list could not be changed.
  compose_reason reason{};
  u32 vic = 0;  ///< 0 when it isn't put first.
};

/// Puts the current mode in front of the selected modes, if the platform wants so and the mode has a VIC.
current_mode_t put_current_mode_first(const inputs_t &inputs, ll_list_t *modes);

/// True for a plausible mode.
bool _valid_current_mode(const video_mode_t &mode);

}  // namespace edid_composer

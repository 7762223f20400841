// Why the new EDID offers its video modes.
#pragma once

#include "edid_composer/explain/decisions.h"
#include "edid_composer/journal.h"
#include "edid_composer/selection/modes_4k_x_2k.h"
#include "edid_composer/selection/video_modes.h"

namespace edid_composer {

/// Short video descriptors of the sink with VICs above @p largest_vic are none of these modes.
void explain_video_modes(const inputs_t &inputs, const video_selection_t &selection, const journal_t &journal,
                         u32 largest_vic, decisions_t *decisions);

/// @p selected is the number of modes before any were added.
void explain_padding(i32 selected, decisions_t *decisions);

void explain_4k_modes(const selection_4k_t &modes, decisions_t *decisions);

}  // namespace edid_composer

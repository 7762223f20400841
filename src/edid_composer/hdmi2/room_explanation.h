// Which of the sink's blocks are passed on, and what was left out for room.
#pragma once

#include "edid_composer/explain/decisions.h"
#include "edid_composer/hdmi2/layer.h"

namespace edid_composer {

void explain_passed_blocks(const layer_inputs_t &inputs, const layer_outcome_t &outcome, decisions_t *decisions);

/// A decision for each sort of thing that was left out.
void explain_room_items(const layer_outcome_t &outcome, bool text_left_out, decisions_t *decisions);

}  // namespace edid_composer

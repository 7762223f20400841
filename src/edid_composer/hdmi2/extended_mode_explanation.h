// Why the new EDID offers its modes above VIC 64.
#pragma once

#include "edid_composer/explain/decisions.h"
#include "edid_composer/hdmi2/plan.h"

namespace edid_composer {

/// Each mode above VIC 64 that sink or platform name.
void explain_extended_modes(const layer_inputs_t &inputs, const plan_t &plan, decisions_t *decisions);

}  // namespace edid_composer

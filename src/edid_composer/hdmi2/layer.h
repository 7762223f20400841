// What HDMI 2 adds to a composition: from what was composed without it to the record and the data blocks to encode.
#pragma once

#include "edid_composer/hdmi2/room.h"

namespace edid_composer {

/// What the stages have decided.
struct layer_outcome_t {
  link_rates_t rates;
  plan_t plan;
  offer_t offer;
  u32 base_modes;  ///< Up to VIC 64, before any was left out for room.
};

/// Decides on everything and changes the record. False when a list entry could not be had.
bool add_hdmi2(const layer_inputs_t &inputs, const population_t &population, edid_t *record, layer_outcome_t *outcome);

}  // namespace edid_composer

// What a plan changes in the record that was composed without HDMI 2.
#pragma once

#include "edid_composer/hdmi2/offer.h"

namespace edid_composer {

/// Changes modes, depths, TMDS clock, range limits and detailed timings. False when a list entry could not be had.
bool change_record(const layer_inputs_t &inputs, const plan_t &plan, const offer_t &offer, edid_t *record);

}  // namespace edid_composer

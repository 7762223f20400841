// What the log says of HDMI 2: warnings of what a platform asks for in vain, traces of the decisions.
#pragma once

#include "edid_composer/hdmi2/offer.h"

namespace edid_composer {

/// Traces the rates, and each mode above VIC 64 with its verdict.
void report_modes(const layer_inputs_t &inputs, const link_rates_t &rates, const extended_modes_t &modes);

/// Reports what does not go together in the offer, and traces what it holds.
void report_offer(const layer_inputs_t &inputs, const offer_t &offer);

}  // namespace edid_composer

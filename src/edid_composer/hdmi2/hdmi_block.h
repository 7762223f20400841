// What HDMI 2 changes in the HDMI vendor-specific data block: colour depths and the maximum TMDS clock.
#pragma once

#include "edid_composer/hdmi2/plan.h"

namespace edid_composer {

/// The depths of the platform; on demand those of them that the sink has too.
deep_color_t depths_for_sink(const layer_inputs_t &inputs, const deep_color_t &of_platform);

/// The maximum TMDS clock for modes of either kind, as far as box and sink take it.
///
/// @param rate what the link to the box has to carry, MHz.
tmds_clock_t tmds_clock_with_extended(const layer_inputs_t &inputs, const base_offer_t &base, const plan_t &plan,
                                      const link_rates_t &rates, u32 rate, const deep_color_t &depths);

}  // namespace edid_composer

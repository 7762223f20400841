// Room in the CTA-861 extension: what is left out so that the rest fits.
#pragma once

#include "edid_composer/hdmi2/offer.h"

namespace edid_composer {

/// Where the data blocks end at most: with the detailed timing after them, right before the checksum. Decoders in the
/// field refuse timings that begin after byte 110.
inline constexpr u32 most_data_block_end = 109;

/// The plan that fits, and its offer: everything that was chosen, less what has no room, which is reported.
plan_t plan_within_room(const layer_inputs_t &inputs, const base_offer_t &base, const link_rates_t &rates,
                        const extended_modes_t &chosen, offer_t *offer);

}  // namespace edid_composer

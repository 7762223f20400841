// Why the values that the new EDID derives are what they are.
#pragma once

#include "edid_composer/explain/decisions.h"
#include "edid_composer/new_edid/population.h"
#include "edid_decode_encode/encoder.h"

namespace edid_composer {

/// @p record is the one that was encoded.
void explain_values(const inputs_t &inputs, const population_t &population, const edid_t &record,
                    decisions_t *decisions);

void explain_room(const encoding_t &encoding, const u8 *new_edid, decisions_t *decisions);

}  // namespace edid_composer

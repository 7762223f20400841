// Why the new EDID offers what it offers of HDMI 2.
#pragma once

#include "edid_composer/explain/decisions.h"
#include "edid_composer/hdmi2/layer.h"
#include "edid_decode_encode/encoder.h"

namespace edid_composer {

/// @p record is the one that was encoded.
void explain_hdmi2(const layer_inputs_t &inputs, const layer_outcome_t &outcome, const edid_t &record,
                   const encoding_t &encoding, decisions_t *decisions);

}  // namespace edid_composer

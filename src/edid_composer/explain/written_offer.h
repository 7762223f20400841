// What the bytes of the new EDID offer, as every source reads them.
#pragma once

#include "edid_composer/explain/decisions.h"

namespace edid_composer {

/// Sets the places of the chosen candidates; one that is not in the bytes is left out. @p new_edid has 256 bytes.
void place_candidates(const u8 *new_edid, decisions_t *decisions);

}  // namespace edid_composer

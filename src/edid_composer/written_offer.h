// What of the chosen modes and formats a source finds in the bytes of the new EDID.
#pragma once

#include "edid_composer/decisions.h"

namespace edid_composer {

/// Gives each chosen candidate its position in @p new_edid, and leaves out what has none there.
void settle_decisions(decisions_t *decisions, const u8 *new_edid);

}  // namespace edid_composer

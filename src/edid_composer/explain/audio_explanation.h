// Why the new EDID offers its audio formats.
#pragma once

#include "edid_composer/explain/decisions.h"
#include "edid_composer/journal.h"

namespace edid_composer {

void explain_audio_formats(const inputs_t &inputs, const journal_t &journal, decisions_t *decisions);

}  // namespace edid_composer

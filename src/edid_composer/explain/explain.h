// One pass over what the stages have returned: who named each candidate, what became of it, and why.
#pragma once

#include "edid_composer/explain/decisions.h"
#include "edid_composer/journal.h"
#include "edid_composer/new_edid/population.h"
#include "edid_composer/selection/modes_4k_x_2k.h"
#include "edid_composer/selection/video_modes.h"
#include "edid_decode_encode/encoder.h"

namespace edid_composer {

/// What the stages have returned.
struct outcomes_t {
  video_selection_t video{};
  selection_4k_t modes_4k{};
  population_t population{};
  encoding_t encoding{};
};

/// Explains a composition that has succeeded, but for the places of what is offered (written_offer.h); @p new_edid are
/// its 256 bytes, @p record what they were made from. Video modes are those up to @p largest_vic.
void explain(const inputs_t &inputs, const outcomes_t &outcomes, const journal_t &journal, const edid_t &record,
             const u8 *new_edid, u32 largest_vic, decisions_t *decisions);

}  // namespace edid_composer

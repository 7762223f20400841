#include "edid_composer/explain/explain.h"

#include "edid_composer/explain/audio_explanation.h"
#include "edid_composer/explain/value_explanation.h"
#include "edid_composer/explain/video_explanation.h"

namespace edid_composer {

void explain(const inputs_t &inputs, const outcomes_t &outcomes, const journal_t &journal, const edid_t &record,
             const u8 *new_edid, u32 largest_vic, decisions_t *decisions) {
  explain_video_modes(inputs, outcomes.video, journal, largest_vic, decisions);
  explain_4k_modes(outcomes.modes_4k, decisions);
  explain_audio_formats(inputs, journal, decisions);
  explain_values(inputs, outcomes.population, record, decisions);
  explain_padding(outcomes.population.modes_before_padding, decisions);
  explain_room(outcomes.encoding, new_edid, decisions);
}

}  // namespace edid_composer

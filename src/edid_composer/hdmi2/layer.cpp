#include "edid_composer/hdmi2/layer.h"

#include "edid_composer/hdmi2/layer_lines.h"
#include "edid_composer/hdmi2/record_changes.h"

namespace edid_composer {

bool add_hdmi2(const layer_inputs_t &inputs, const population_t &population, edid_t *record, layer_outcome_t *outcome) {
  const base_offer_t base{*record, population};
  outcome->base_modes = record->video_list.size;
  outcome->rates = link_rates(inputs);
  const extended_modes_t chosen = select_extended_modes(inputs, outcome->rates);
  report_modes(inputs, outcome->rates, chosen);
  outcome->plan = plan_within_room(inputs, base, outcome->rates, chosen, &outcome->offer);
  report_offer(inputs, outcome->offer);
  return change_record(inputs, outcome->plan, outcome->offer, record);
}

}  // namespace edid_composer

// Filling of the new record.
#pragma once

#include "diagnostics.h"
#include "edid_composer/inputs.h"
#include "edid_composer/new_edid/deep_color.h"
#include "edid_composer/new_edid/latencies.h"
#include "edid_composer/new_edid/physical_address.h"
#include "edid_composer/new_edid/tmds_clock.h"
#include "edid_composer/selection/modes_4k_x_2k.h"

namespace edid_composer {

/// The derived values of the new record, each with its reason.
struct population_t {
  bool complete = false;  ///< False: a list entry could not be had, or a mode has no timing.
  latency_t latencies[latency_count]{};
  compose_reason reason_of_3d{};
  physical_address_t physical_address{};
  deep_color_t deep_color{};
  tmds_clock_t tmds_clock{};
  i32 modes_before_padding = 0;
};

/// Fills every field of @p new_edid but its audio list. Its video list holds the selected modes already.
population_t _populate_new_edid(const inputs_t &inputs, const hdmi_vics_t &modes_4k, edid_t *new_edid);

}  // namespace edid_composer

// Numbers of the configuration that have no meaning although they are within their limits.
#pragma once

#include "utility/configuration.h"

namespace edid_composer {

/// There are two refresh families; what names neither is reported.
void settle_refresh_rate(configuration_outcome_t *rate);
/// A year has at most 53 weeks; 255 marks the year as a model year (EDID 1.3, section 3.4).
void settle_week(configuration_outcome_t *week);
/// Deep colour is offered as the platform values say, or where the sink has it too; 1 is reported.
void settle_deep_color(configuration_outcome_t *deep_color);

}  // namespace edid_composer

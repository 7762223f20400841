// What is wrong between entries of the platform's lists: repetitions, and what no composition can offer.
#pragma once

#include "platform/configuration_readings.h"
#include "platform/finding.h"

namespace edid_cli {

/// @p without_sink: an observed composition without a sink; also one that the library has refused.
findings_t find_between_entries(const composition_t &without_sink);

}  // namespace edid_cli

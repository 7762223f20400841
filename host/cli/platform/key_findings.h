// What is wrong with single keys and entries of the platform configuration that is loaded.
#pragma once

#include "platform/configuration_readings.h"
#include "platform/finding.h"

namespace edid_cli {

/// What the library replaced, passed over or will not offer, and texts that sources cannot show.
findings_t find_in_readings(const std::vector<kept_reading_t> &readings);

}  // namespace edid_cli

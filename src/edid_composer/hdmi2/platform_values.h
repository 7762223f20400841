// What the platform says of HDMI 2: from the configuration, or from the caller.
#pragma once

#include "edid_composer/platform/configuration_readings.h"

namespace edid_composer {

/// Whether the configuration asks for HDMI 2. Where it has no such key, that is the one look-up.
bool is_hdmi2_configured(const configuration_readings_t &readings);

/// Fills the values from the configuration that asks for them.
void read_hdmi2_values(hdmi2_values_t *values, const configuration_readings_t &readings);

/// True when a caller's record is large enough to say whether HDMI 2 is wanted; else reported.
bool has_enable(const hdmi2_values_t &given);

/// Whether a caller's record asks for HDMI 2.
bool is_hdmi2_enabled(const hdmi2_values_t &given);

/// Takes over a caller's values, which ask for HDMI 2. Members that its record does not have, and numbers outside of
/// their limits, are replaced; the latter is reported.
void take_hdmi2_values(const hdmi2_values_t &given, hdmi2_values_t *values);

/// A tri-state: never, always, or as the sink.
constexpr bool tri_state(i32 value, bool sink_value) {
  constexpr i32 as_sink = 2;
  return value == as_sink ? sink_value : value != 0;
}

}  // namespace edid_composer

// What every stage of HDMI 2 decides from.
#pragma once

#include "edid_composer/inputs.h"

namespace edid_composer {

struct layer_inputs_t {
  const inputs_t &base;
  const hdmi2_values_t &platform;
  const hdmi2_t &sink;  ///< Holds 0 without a readable sink.
  bool has_sink;        ///< A sink was given, readable or not.
};

inline constexpr u32 khz_per_mhz = 1000;

/// The HDMI block tells rates up to this one, MHz; the HDMI Forum block those above.
inline constexpr u32 largest_hdmi_rate = 340;

constexpr u32 up_to_multiple(u32 number, u32 step) {
  return (number + step - 1) / step * step;
}

/// A clock in kHz as a rate in MHz that blocks can tell: the next multiple of 5.
constexpr u32 rate_for_clock(u32 khz) {
  constexpr u32 rate_unit = 5;
  return up_to_multiple(khz, rate_unit * khz_per_mhz) / khz_per_mhz;
}

}  // namespace edid_composer

// The refresh family whose mode lists are used.
#pragma once

#include "edid_composer/inputs.h"

namespace edid_composer {

struct native_rate_t {
  i32 hz;  ///< 50 or 60.
  compose_reason reason;
  reason_values_t values;
};

/// That of the sink's first mode whose refresh rate belongs to a family, else the platform's.
native_rate_t _determine_tv_native_refresh_rate(const inputs_t &inputs);

}  // namespace edid_composer

// Sinks and platforms with HDMI 2 at random.
#pragma once

#include "random_situation.h"

namespace properties {

/// A sink whose one to three CTA-861 extensions hold data blocks of HDMI 2 beside those of today, mostly long enough.
test_support::bytes_t random_hdmi2_sink(random_source_t &random);

/// Platform values within their limits, turned on.
hdmi2_values_t random_hdmi2_values(random_source_t &random);

}  // namespace properties

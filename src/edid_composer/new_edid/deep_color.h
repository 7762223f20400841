// The colour depths that the new EDID offers.
#pragma once

#include "edid_composer/inputs.h"

namespace edid_composer {

struct deep_color_t {
  bool bits_30;
  bool bits_36;
  bool requires_36;  ///< 36 bit is offered because HDMI requires it beside 30 bit, not because the platform does.
  bool sink_lacks_30 = false;  ///< Not offered because the sink doesn't have it.
  bool sink_lacks_36 = false;

  bool any() const { return bits_30 || bits_36; }
};

deep_color_t offer_deep_color(const platform_values_t &platform);

}  // namespace edid_composer

// The TMDS character rates between source, box and sink, MHz.
#pragma once

#include "edid_composer/hdmi2/layer_inputs.h"

namespace edid_composer {

struct link_rates_t {
  u32 platform;  ///< What the box's receiver takes.
  u32 sink;      ///< What the sink takes; the platform's without a sink.
  u32 both;      ///< What goes through to the sink.
};

link_rates_t link_rates(const layer_inputs_t &inputs);

}  // namespace edid_composer

// What is wrong between the keys of a platform's table of HDMI 2: each may be right alone.
#pragma once

#include "composition/composition.h"
#include "platform/finding.h"

namespace edid_cli {

findings_t find_in_hdmi2_table(const composition_t &without_sink);

}  // namespace edid_cli

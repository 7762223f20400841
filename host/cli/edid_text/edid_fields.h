// The named fields of a decoded EDID.
#pragma once

#include <vector>

#include "edid_text/edid_field.h"

namespace edid_cli {

/// All of them: the base block, the HDMI 1.4 fields of the first extension, and what HDMI 2 added in all extensions.
const std::vector<edid_field_t> &edid_fields();

}  // namespace edid_cli

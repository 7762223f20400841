// The named fields of what HDMI 2 added to an EDID.
#pragma once

#include <span>

#include "edid_text/edid_field.h"

namespace edid_cli {

/// In the order in which the data blocks are composed.
std::span<const edid_field_t> hdmi2_fields();

}  // namespace edid_cli

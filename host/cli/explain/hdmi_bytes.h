// The HDMI vendor-specific data block: HDMI 1.4a, section 8.3.2.
#pragma once

#include "explain/byte_fields.h"

namespace edid_cli {

/// Names its payload, up to @p end.
void name_hdmi_block(byte_naming_t &naming, std::size_t end);

}  // namespace edid_cli

// The CEC physical address as people write it.
#pragma once

#include <string>

#include "edid_composer.h"

namespace edid_cli {

/// "2.1.0.0" for 0x2100.
std::string physical_address_text(u32 address);

/// That of an EDID; "-" when it has no HDMI block.
std::string physical_address_text(const edid_t &edid);

}  // namespace edid_cli

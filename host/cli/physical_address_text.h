// The CEC physical address as people write it.
#pragma once

#include <string>

#include "edid_composer.h"

namespace edid_cli {

/// "2.1.0.0"; "-" when the EDID has no HDMI block.
inline std::string physical_address_text(const edid_t &edid) {
  if (edid.hdmi_present == 0) {
    return "-";
  }
  std::string text;
  for (const u8 part : edid.physical_address) {
    text += (text.empty() ? "" : ".") + std::to_string(part);
  }
  return text;
}

}  // namespace edid_cli

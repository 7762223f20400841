#include "edid_text/physical_address_text.h"

namespace edid_cli {

std::string physical_address_text(u32 address) {
  std::string text;
  for (const u32 shift : {12U, 8U, 4U, 0U}) {
    text += (text.empty() ? "" : ".") + std::to_string(address >> shift & 0x0FU);
  }
  return text;
}

std::string physical_address_text(const edid_t &edid) {
  if (edid.hdmi_present == 0) {
    return "-";
  }
  u32 address = 0;
  for (const u8 part : edid.physical_address) {
    address = address << 4 | part;
  }
  return physical_address_text(address);
}

}  // namespace edid_cli

// The 18-byte descriptors: EDID 1.3, section 3.10.
#pragma once

#include "explain/byte_fields.h"

namespace edid_cli {

inline constexpr std::size_t descriptor_size = 18;

void name_descriptor(byte_naming_t &naming);

}  // namespace edid_cli

// The base block: EDID 1.3, section 3.
#pragma once

#include "explain/byte_fields.h"

namespace edid_cli {

void name_base_block(byte_naming_t &naming);

}  // namespace edid_cli

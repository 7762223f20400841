// The data blocks of the extension: CEA-861, section 7.5.
#pragma once

#include "explain/byte_fields.h"

namespace edid_cli {

void name_data_block(byte_naming_t &naming);

}  // namespace edid_cli

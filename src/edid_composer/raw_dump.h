// Hexadecimal dump of EDID blocks.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

/// Prints @p blocks blocks of 128 bytes; nothing while tracing is off.
void _dump_raw_edid_block(const u8 *bytes, i32 blocks);

}  // namespace edid_composer

// The report of the blocks that are passed on: their bytes, and what is known of them.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

void print_passed_on_blocks(const hdmi2_t &hdmi2);

}  // namespace edid_composer

// The physical address of a platform's input (HDMI 1.4a, section 8.7).
#pragma once

#include "edid_composer/inputs.h"

namespace edid_composer {

struct physical_address_t {
  u8 parts[4];
  compose_reason reason;
  u8 port;  ///< Counted from 1.
};

/// The sink's address with the input's port in the first free place; f.f.f.f when there is none.
physical_address_t place_input(const inputs_t &inputs);

}  // namespace edid_composer

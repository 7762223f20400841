// What a source finds in a new EDID: the bytes decide, not what was meant.
#pragma once

#include "composition/composition.h"
#include "explain/wanted.h"

namespace edid_cli {

/// Whether a source that reads the EDID finds what is wanted.
bool is_offered(const wanted_t &wanted, const new_edid_t &new_edid);

}  // namespace edid_cli

// The physical address of a platform's input (HDMI 1.4a, section 8.7).
#pragma once

#include "diagnostics.h"

namespace edid_composer {

class decisions_t;

/// Sets the new record's address: the sink's, with the input's @p port in the first free place. f.f.f.f when there is
/// none.
void set_physical_address(const site_t &site, bool is_tv, const edid_t &downstream, u8 port, edid_t *new_edid,
                          decisions_t *decisions = nullptr);

}  // namespace edid_composer

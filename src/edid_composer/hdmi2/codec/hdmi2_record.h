// The record that callers hand over.
#pragma once

#include "diagnostics.h"

namespace edid_composer {

/// True when the record is there and has the members of its first version. Otherwise reports an error at @p site.
bool is_record(const site_t &site, const hdmi2_t *hdmi2);

}  // namespace edid_composer

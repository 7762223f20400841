// Reading of all CTA-861 extensions of an EDID into one record.
#pragma once

#include "bytes.h"

namespace edid_composer {

/// decode_hdmi2(), in whose name it warns, of an EDID whose base block and size are known to be right.
///
/// @param hdmi2 holds 0, but for its size.
void read_hdmi2(const byte_view_t &edid, hdmi2_t *hdmi2);

}  // namespace edid_composer

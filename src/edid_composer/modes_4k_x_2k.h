// Selection of the 4Kx2K modes (HDMI_VICs) that the new EDID offers.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

class decisions_t;

/// Sets the new record's HDMI_VICs: the platform's priority list, as far as sink or addition list have its modes.
u8 _filter_4k_modes(const edid_t *downstream, edid_t *new_edid, const platform_values_t *values,
                    decisions_t *decisions = nullptr);

}  // namespace edid_composer

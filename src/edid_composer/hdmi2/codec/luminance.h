// The luminance codes of the HDR static metadata data block (CTA-861, section 7.5.13) in numbers, without floating
// point: every target has the same text for a code.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

/// Units in which each kind of luminance is given, of 1 cd/m2.
inline constexpr u32 maximum_luminance_units = 100;
inline constexpr u32 minimum_luminance_units = 10000;

/// 50 x 2^(code / 32) cd/m2, to the nearest hundredth.
u32 maximum_luminance(u8 code);

/// The luminance of @p maximum_code x (code / 255)^2 / 100, in cd/m2, to the nearest ten-thousandth.
u32 minimum_luminance(u8 maximum_code, u8 code);

}  // namespace edid_composer

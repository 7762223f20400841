// A sink that takes everything that a platform can offer.
#pragma once

#include <span>
#include <vector>

#include "edid_composer.h"

namespace edid_cli {

/// The EDID of a display of the 50 or 60 Hz family that takes these modes in every 3D structure, all 4Kx2K modes, ten
/// audio formats, deep colour, extended gamut and all content types, and delays. Of more modes than one extension holds
/// beside that, the first ones. With modes above VIC 64, a second extension has these and all else that HDMI 2 added.
std::vector<u8> made_sink(u32 family, std::span<const u32> vics, std::span<const u32> extended_vics);

}  // namespace edid_cli

// The short audio descriptor (CEA-861, section 7.5.2), both directions.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

inline constexpr u32 short_audio_size = 3;

/// Type of a short audio descriptor as in the record; 0 for an extension code that is not known.
u32 short_audio_type(u8 byte1, u8 byte3);

/// Writes the 3 bytes of a short audio descriptor; false when the type has none. The types 16 to 18 are overwritten
/// with 15, the format code that they are written as.
bool _encode_edid_short_audio(u8 *cea_block, short_audio_desc_t *audio);

}  // namespace edid_composer

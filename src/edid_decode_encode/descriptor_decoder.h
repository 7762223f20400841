// Decoding of the parts that a base block repeats: standard timings and 18-byte descriptors.
#pragma once

#include "bytes.h"

namespace edid_composer {

/// Decodes one 18-byte descriptor (EDID 1.3, section 3.10): a detailed timing goes to dtd_list, the others to their
/// fields.
u8 _decode_edid_dtd(const byte_view_t &dtd, edid_t *edid);

/// Appends one standard timing (EDID 1.3, section 3.9) to std_timings, unless the pair of bytes marks an unused slot.
u8 _decode_edid_standard_timing(u8 byte_a, u8 byte_b, edid_t *edid);

/// Replaces every byte @p from by @p to in the first @p length bytes.
void _replace_all_chars(u8 *string, i32 length, u8 from, u8 to);

}  // namespace edid_composer

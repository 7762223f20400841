// Encoding of the parts that an EDID is made of. Each answers what it wrote, 0 for nothing.
#pragma once

#include "bytes.h"

namespace edid_composer {

/// Writes the 18 bytes of a detailed timing (EDID 1.3, section 3.10.2); answers 1, or 0 when the timing can't be
/// encoded.
u8 _encode_edid_dtd(u8 *dtd_block, const detailed_timing_t *timing);

/// Writes the 3 bytes of a short audio descriptor (CEA-861, section 7.5.2); answers 1, or 0 when the type has none.
/// The types 16 to 18 are overwritten with 15, the format code that they are written as.
u8 _encode_edid_short_audio(u8 *cea_block, short_audio_desc_t *audio);

/// Writes a text descriptor of 18 bytes (EDID 1.3, section 3.10.3), and a line feed behind it when the text fills it.
/// @p block has room for 19 bytes. Answers 18, or 0 when the text is too short or begins with a blank.
u8 _encode_string(u8 *block, u8 tag, const char *string);

/// Puts the text descriptor of a record's field behind what @p block holds; nothing when it has none.
void put_text_descriptor(byte_writer_t *block, u8 tag, const char *text);

}  // namespace edid_composer

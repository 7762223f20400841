// The 18-byte descriptor (EDID 1.3, section 3.10), both directions.
#pragma once

#include "bytes.h"
#include "linked_list/typed_list.h"

namespace edid_composer {

/// True for a display descriptor, whose pixel clock is 0; false for a detailed timing.
bool is_display_descriptor(const byte_view_t &descriptor);

/// Appends the detailed timings of a record's descriptors.
appender_t<detailed_timing_t> detailed_timing_appender(edid_t *edid, entry_arena_t *arena);

/// Decodes one descriptor: a detailed timing is appended to @p timings, the others go to their fields of the record.
bool _decode_edid_dtd(const byte_view_t &dtd, appender_t<detailed_timing_t> *timings, edid_t *edid);

/// Replaces every byte @p from by @p to in the first @p length bytes.
void _replace_all_chars(u8 *string, i32 length, u8 from, u8 to);

/// Writes the 18 bytes of a detailed timing (section 3.10.2); false when the timing can't be encoded.
bool _encode_edid_dtd(u8 *dtd_block, const detailed_timing_t *timing);

/// Writes a text descriptor of 18 bytes (section 3.10.3), and a line feed after it when the text fills it. @p block has
/// room for 19 bytes. False when the text is too short or begins with a blank.
bool _encode_string(u8 *block, u8 tag, const char *string);

/// Puts the text descriptor of a record's field after what @p block holds; nothing when it has none.
void put_text_descriptor(byte_writer_t *block, u8 tag, const char *text);

}  // namespace edid_composer

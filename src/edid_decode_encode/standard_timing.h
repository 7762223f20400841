// The standard timing (EDID 1.3, section 3.9), both directions.
#pragma once

#include "bytes.h"
#include "linked_list/typed_list.h"

namespace edid_composer {

/// Appends the standard timings of a record.
appender_t<std_timing_t> standard_timing_appender(edid_t *edid, entry_arena_t *arena);

/// Appends one standard timing, unless the pair of bytes marks an unused slot. False when it could not be kept.
bool _decode_edid_standard_timing(u8 byte_a, u8 byte_b, appender_t<std_timing_t> *timings);

void put_standard_timing(byte_writer_t *block, const std_timing_t &timing);
void put_unused_standard_timing(byte_writer_t *block);

}  // namespace edid_composer

// An EDID record with its lists as vectors: it can be copied, changed and compared.
#pragma once

#include <string>
#include <vector>

#include "edid_composer.h"
#include "edid_decode_encode/record_fields.h"
#include "random_source.h"

namespace properties {

struct plain_record_t {
  edid_t scalars{};  ///< Its lists stay empty.
  std::vector<std_timing_t> std_timings;
  std::vector<detailed_timing_t> timings;
  std::vector<short_video_desc_t> video;
  std::vector<short_audio_desc_t> audio;
};

/// Everything into a record that was prepared and is otherwise empty.
void write_to(edid_t *edid, const plain_record_t &record);

/// By name, as codec_test::fields_of() gives them.
codec_test::fields_t fields_of(const plain_record_t &record);

/// A record that the encoder accepts: two detailed timings, every field within the range that its documentation gives.
plain_record_t random_record(random_source_t &random);

/// A record as the decoder makes one: every field has a value that its bytes can hold, and all of it fits.
plain_record_t random_canonical_record(random_source_t &random);

/// A timing that fits its descriptor, with a pixel clock that is not a multiple of 10 kHz.
detailed_timing_t random_timing(random_source_t &random);

/// A text for a field of @p size bytes: up to all of them, with blanks anywhere and sometimes a line feed.
std::string random_text(random_source_t &random, std::size_t size);

}  // namespace properties

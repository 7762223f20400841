// Records as named texts, so that a comparison covers every field and its failure names the ones that differ.
#pragma once

#include <map>
#include <string>

#include "edid_composer.h"

namespace codec_test {

/// Field name and value, numbers in decimal. Entries of lists are called like "dtd_list[0].h_active".
using fields_t = std::map<std::string, std::string>;

fields_t fields_of(const detailed_timing_t &timing);
fields_t fields_of(const std_timing_t &timing);
fields_t fields_of(const short_video_desc_t &video);
fields_t fields_of(const short_audio_desc_t &audio);
fields_t fields_of(const edid_t &edid);

/// The fields of @p after that @p before doesn't hold with the same value; what only @p before has becomes "(gone)".
fields_t difference(const fields_t &before, const fields_t &after);

/// @p fields with @p prefix before each name.
fields_t prefixed(const std::string &prefix, const fields_t &fields);

/// Both together.
fields_t together(fields_t a, const fields_t &b);

}  // namespace codec_test

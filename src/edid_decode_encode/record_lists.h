// The lists that a record consists of.
#pragma once

#include "linked_list/typed_list.h"

namespace edid_composer {

/// The four lists of a record, in the order in which they are checked, initialised and deleted.
/// kept: two lists have another name when they are missing at destruction.
struct record_list_t {
  ll_list_t edid_t::*list;
  u32 element_tag;
  const char *name;
  const char *name_when_missing;
};

inline constexpr record_list_t record_lists[] = {
    {&edid_t::std_timings, element_tag<std_timing_t>, "standard_timing_list", "standard_timing_list"},
    {&edid_t::dtd_list, element_tag<detailed_timing_t>, "detailed_timing_list", "detailed_timing_list"},
    {&edid_t::video_list, element_tag<short_video_desc_t>, "short_video_description_list",
     "short_video_description_timing_list"},
    {&edid_t::audio_list, element_tag<short_audio_desc_t>, "short_audio_description_list",
     "short_audio_description_timing_list"},
};

}  // namespace edid_composer

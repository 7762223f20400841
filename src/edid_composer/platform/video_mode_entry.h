// An entry of a list of video modes: a VIC and up to three 3D flags, as in "16 FP TBH".
#pragma once

#include <cstdint>

#include "edid_composer/platform/configuration_list.h"
#include "linked_list/typed_list.h"
#include "utility/configuration.h"

namespace edid_composer {

/// A number, and up to three words of up to nine characters.
struct video_mode_words_t {
  std::int64_t number;
  char flags[3][10];
};

/// Reads @p text as scanf reads "%ld%9s%9s%9s" with a 64-bit long. Returns the number of fields, 0 without a number;
/// words that aren't there stay as they are.
int _scan_video_mode(const char *text, video_mode_words_t *words);

/// Appends the mode of an entry; one that is none is reported. The number of the outcome is the VIC.
configuration_outcome_t _get_vic_list_callback(const configuration_entry_t &entry,
                                               appender_t<short_video_desc_t> *modes);

appender_t<short_video_desc_t> video_mode_appender(ll_list_t *modes, entry_arena_t *arena);

}  // namespace edid_composer

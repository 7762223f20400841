// Reading of a list of the platform configuration, whatever it holds.
#pragma once

#include "edid_composer/platform/configuration_list.h"
#include "edid_composer/platform/configuration_readings.h"

namespace edid_composer {

/// Reads a list: each entry of its kind is parsed, and what became of every one is noted.
template <typename parser_t>
void read_list(const configuration_key_t &key, const configuration_readings_t &readings, parser_t parse) {
  configuration_list_t list = _get_generic_platform_list(key);
  i32 entries = 0;
  i32 counting = 0;
  for (const configuration_entry_t &entry : list) {
    const configuration_outcome_t outcome =
        entry.kind == entry_kind_t::other ? configuration_outcome_t{.reason = CONFIGURATION_WRONG_KIND} : parse(entry);
    readings.note_entry(entry, outcome, is_taken(outcome.reason) ? counting++ : -1);
    ++entries;
  }
  const bool is_empty = key.kind == CONFIGURATION_VIDEO_MODES && counting == 0;
  readings.note_list(key,
                     !list.is_there() ? CONFIGURATION_ABSENT
                     : is_empty       ? CONFIGURATION_EMPTY
                                      : CONFIGURATION_TAKEN,
                     entries, counting);
}

}  // namespace edid_composer

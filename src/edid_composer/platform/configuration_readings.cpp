#include "edid_composer/platform/configuration_readings.h"

#include <iterator>

namespace edid_composer {
namespace {

constexpr i32 the_key_itself = -1;

constexpr configuration_reading_t reading_of(const configuration_key_t &key, const configuration_outcome_t &outcome) {
  return {.size = sizeof(configuration_reading_t),
          .reason = outcome.reason,
          .key = &key,
          .entry = the_key_itself,
          .place = -1,
          .node = "",
          .text = "",
          .found = outcome.found,
          .used = outcome.used};
}

/// By their numbers, from 1 on.
constexpr const char *reason_texts[] = {
    "taken as it is",
    "absent, or of another kind",
    "below the smallest, which is taken",
    "above the largest, which is taken",
    "without a meaning: another one is taken",
    "no entry of the list counts",
    "not of the list's kind",
    "outside of its limits",
    "does not begin with a number",
    "names an unknown 3D structure",
    "after the last entry that counts",
    "a width that is no multiple of 8",
    "a width that a standard timing cannot hold: another one is offered",
    "a height that gives none of the aspect ratios",
    "a refresh rate with a fraction, which is rounded up",
    "no memory for it",
};
static_assert(std::size(reason_texts) == CONFIGURATION_OUT_OF_MEMORY);

}  // namespace

bool is_taken(configuration_reason reason) {
  return reason == CONFIGURATION_TAKEN || reason == CONFIGURATION_WIDTH_NOT_ENCODABLE ||
         reason == CONFIGURATION_RATE_ROUNDED_UP;
}

void configuration_readings_t::note(const configuration_key_t &key, const configuration_outcome_t &outcome,
                                    const char *text) const {
  if (observer_ == nullptr) return;
  configuration_reading_t reading = reading_of(key, outcome);
  reading.text = text;
  pass_on(reading);
}

void configuration_readings_t::note_entry(const configuration_entry_t &entry, const configuration_outcome_t &outcome,
                                          i32 place) const {
  if (observer_ == nullptr) return;
  configuration_reading_t reading = reading_of(*entry.key, outcome);
  reading.entry = entry.index;
  reading.place = place;
  reading.node = entry.node_name;
  if (entry.kind == entry_kind_t::text) reading.text = entry.text;
  pass_on(reading);
}

void configuration_readings_t::note_audio_format(const configuration_key_t &key, i32 letter, i32 value,
                                                 i32 place) const {
  if (observer_ == nullptr) return;
  configuration_reading_t reading = reading_of(key, {.found = value, .used = value});
  reading.entry = letter;
  reading.place = place;
  pass_on(reading);
}

void configuration_readings_t::note_list(const configuration_key_t &key, configuration_reason reason, i32 entries,
                                         i32 counting) const {
  if (observer_ == nullptr) return;
  pass_on(reading_of(key, {.reason = reason, .found = entries, .used = counting}));
}

void configuration_readings_t::pass_on(const configuration_reading_t &reading) const {
  observer_(&reading, context_);
}

}  // namespace edid_composer

const char *configuration_reason_string(u32 reason) {
  return reason >= 1 && reason <= std::size(edid_composer::reason_texts) ? edid_composer::reason_texts[reason - 1]
                                                                         : "unknown";
}

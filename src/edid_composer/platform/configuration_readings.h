// What was read of the configuration, key by key, for whoever observes a composition.
#pragma once

#include "edid_composer/platform/configuration_list.h"
#include "utility/configuration.h"

namespace edid_composer {

/// Passes what is read on to an observer; without one, to nobody.
class configuration_readings_t {
 public:
  configuration_readings_t() = default;
  configuration_readings_t(configuration_observer_t observer, void *context) : observer_(observer), context_(context) {}

  /// A key with its number, or with its text.
  void note(const configuration_key_t &key, const configuration_outcome_t &outcome, const char *text = "") const;
  /// An entry of a list; @p place: among those that count, or -1.
  void note_entry(const configuration_entry_t &entry, const configuration_outcome_t &outcome, i32 place) const;
  /// A format of the platform; @p letter is its place in the alphabet.
  void note_audio_format(const configuration_key_t &key, i32 letter, i32 value, i32 place) const;
  /// A list, after its entries.
  void note_list(const configuration_key_t &key, configuration_reason reason, i32 entries, i32 counting) const;

 private:
  void pass_on(const configuration_reading_t &reading) const;

  configuration_observer_t observer_ = nullptr;
  void *context_ = nullptr;
};

/// Whether an entry of which this became counts.
bool is_taken(configuration_reason reason);

}  // namespace edid_composer

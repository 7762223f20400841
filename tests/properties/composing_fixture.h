// Composing from random situations.
#pragma once

#include <gtest/gtest.h>

#include "composed_edid.h"
#include "property_runs.h"
#include "random_situation.h"
#include "support/output_capture.h"

namespace properties {

/// A composition, and all that it printed.
struct printed_composition_t : test_support::composition_t {
  std::string output;
};

inline printed_composition_t compose_printing(const test_support::bytes_t &sink, const compose_cfg_t &settings,
                                              const platform_values_t *values) {
  printed_composition_t printed;
  printed.output = test_support::raw_output_of(
      [&] { static_cast<test_support::composition_t &>(printed) = test_support::compose(sink, settings, values); });
  return printed;
}

/// Platform values as the situation's configuration gives them.
class values_of_t {
 public:
  explicit values_of_t(const test_support::platform_configuration_t &platform) { platform.write_to(values_.get()); }
  const platform_values_t *get() { return values_.get(); }

 private:
  test_support::scoped_values_t values_;
};

inline printed_composition_t compose(const situation_t &situation) {
  values_of_t values(situation.platform);
  return compose_printing(situation.sink.bytes, situation.settings, values.get());
}

/// The one way in which a composition may fail that is given all it needs: its first audio format is one that nobody
/// knows, which is never filtered out and cannot be encoded.
inline bool failed_for_unknown_audio(const printed_composition_t &composition) {
  return !composition.result && test_support::count_of(composition.output, "Audio type is not recognied. Type:0") == 1;
}

/// The platform's lists name the audio bit of a type: see compose_cfg_t::audio_mask.
inline u32 mask_bit_of(u32 audio_type) {
  if (audio_type >= 1 && audio_type <= 14) return 1u << (audio_type - 1);
  if (audio_type >= 16 && audio_type <= 18) return 1u << (audio_type - 2);
  return 0;
}

}  // namespace properties

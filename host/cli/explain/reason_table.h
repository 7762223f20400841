// Reasons as sentences with places for numbers, and the keys and settings that they come from.
#pragma once

#include "edid_composer.h"

namespace edid_cli {

/// What of the sink's a reason refers to, by the number in its first value.
enum class sink_part_t { none, detailed_timing, standard_timing, short_video, address, formats };

struct reason_text_t {
  u32 reason;
  /// Words, with places in braces: see reason_sentence().
  const char *sentence;
  const char *keys[2] = {nullptr, nullptr};  ///< Of the platform; null: none.
  const char *setting = nullptr;             ///< An option of the command line; null: none.
  sink_part_t sink_part = sink_part_t::none;
  /// The sentence for a sink that was not read to its end, where the reason rests on what the sink doesn't have: with
  /// {missing} for the part that was not read. Null: the reason doesn't rest on it.
  const char *unread_sentence = nullptr;
};

/// The row of a reason; one without keys for a reason that is not known.
const reason_text_t &reason_text(u32 reason);

}  // namespace edid_cli

// What the selection of the audio formats tells an observer.
#pragma once

#include "edid_composer/decisions.h"

namespace edid_composer {

/// Whose formats are offered: the platform's setting "audio_pass_through".
enum pass_through_t : i32 {
  platform_only = 0,
  platform_and_sink = 1,
  sink_only = 2,
};

/// The verdict on one format, as it goes through the selection. Does nothing when nobody observes.
class audio_verdict_t {
 public:
  audio_verdict_t(decisions_t *decisions, compose_origin origin, i32 index)
      : decision_(decisions == nullptr ? nullptr : begin(decisions, origin, index)), decisions_(decisions) {}

  void not_a_format(i32 value);
  /// What it is before the sink narrows it.
  void format(const short_audio_desc_t &audio);
  /// The pass-through setting doesn't look at it.
  void ignored(u32 type, i32 pass_through);
  void not_in_sink();
  /// An entry of @p list covers it.
  void duplicate(const ll_list_t &list, const short_audio_desc_t &audio);
  void chosen(const short_audio_desc_t &audio);

 private:
  static compose_decision_t *begin(decisions_t *decisions, compose_origin origin, i32 index);

  compose_decision_t *decision_;
  decisions_t *decisions_;
  short_audio_desc_t asked_for_{};
};

/// Notes the formats of the side that the pass-through setting leaves out.
void note_ignored_formats(decisions_t *decisions, i32 pass_through, const ll_list_t &platform_audio,
                          const ll_list_t &sink_audio);

/// The chosen format at @p position is taken out again: its type's @p bit is not in @p mask.
void note_masked_format(decisions_t *decisions, u32 position, u32 bit, u32 mask);

void note_basic_audio(decisions_t *decisions, const short_audio_desc_t &audio);

}  // namespace edid_composer

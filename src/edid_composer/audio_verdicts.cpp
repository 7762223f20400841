#include "edid_composer/audio_verdicts.h"

#include "edid_composer/audio_formats.h"
#include "edid_decode_encode/cea_extension_layout.h"
#include "linked_list/walk.h"

namespace edid_composer {
namespace {

bool same_format(const short_audio_desc_t &a, const short_audio_desc_t &b) {
  return a.channels == b.channels && a.frequencies == b.frequencies && a.pcm_bits == b.pcm_bits &&
         a.max_bitrate == b.max_bitrate && a.value == b.value && a.wma_profile == b.wma_profile;
}

/// Type of a platform format. It is not decoded, as one that can't be is reported then.
u32 type_of(i32 platform_format) {
  namespace layout = short_audio;
  const auto bytes = static_cast<u32>(platform_format);
  const u32 type = bytes >> layout::format_shift & layout::format_mask;
  const u32 extension = (bytes >> 16 & 0xFF) >> layout::extension_shift;
  if (type != layout::extension_escape) return type;
  return extension >= 1 && extension <= layout::last_extension ? layout::extended_type_base + extension : 0;
}

/// Place of the first entry that covers the format.
i32 place_of_cover(const site_t &site, const ll_list_t &list, const short_audio_desc_t &audio) {
  i32 place = 0;
  for (const auto &entry : walk<const short_audio_desc_t>(LIST_AS(site, &list))) {
    if (_covers(entry, audio)) return place;
    ++place;
  }
  return place;
}

}  // namespace

compose_decision_t *audio_verdict_t::begin(decisions_t *decisions, compose_origin origin, i32 index) {
  compose_decision_t *const decision = decisions->add(COMPOSE_SUBJECT_AUDIO_FORMAT, 0);
  decision->origins = origin;
  (origin == COMPOSE_ORIGIN_SINK_AUDIO ? decision->sink_index : decision->priority_index) = index;
  return decision;
}

void audio_verdict_t::not_a_format(i32 value) {
  if (decision_ == nullptr) return;
  decide(decision_, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NOT_AN_AUDIO_FORMAT, reason_values(value));
}

void audio_verdict_t::format(const short_audio_desc_t &audio) {
  if (decision_ == nullptr) return;
  decision_->code = audio.type;
  asked_for_ = audio;
}

void audio_verdict_t::ignored(u32 type, i32 pass_through) {
  if (decision_ == nullptr) return;
  decision_->code = type;
  decide(decision_, COMPOSE_VERDICT_LEFT_OUT,
         pass_through >= sink_only ? COMPOSE_REASON_SINK_FORMATS_ONLY : COMPOSE_REASON_PLATFORM_FORMATS_ONLY,
         reason_values(pass_through));
}

void audio_verdict_t::not_in_sink() {
  if (decision_ == nullptr) return;
  decide(decision_, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NOT_IN_SINK, reason_values(asked_for_.channels));
}

void audio_verdict_t::duplicate(const ll_list_t &list, const short_audio_desc_t &audio) {
  if (decision_ == nullptr) return;
  decide(decision_, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_DUPLICATE,
         reason_values(audio.channels, place_of_cover(decisions_->site(), list, audio)));
}

void audio_verdict_t::chosen(const short_audio_desc_t &audio) {
  if (decision_ == nullptr) return;
  if (!same_format(audio, asked_for_)) {
    decide(decision_, COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_NARROWED_TO_SINK,
           reason_values(asked_for_.channels, audio.channels, asked_for_.frequencies, audio.frequencies));
  } else {
    const bool of_sink = (decision_->origins & COMPOSE_ORIGIN_SINK_AUDIO) != 0;
    decide(decision_, COMPOSE_VERDICT_OFFERED, of_sink ? COMPOSE_REASON_SINK_FORMAT : COMPOSE_REASON_PLATFORM_FORMAT,
           reason_values(audio.channels));
  }
}

void note_ignored_formats(decisions_t *decisions, i32 pass_through, const ll_list_t &platform_audio,
                          const ll_list_t &sink_audio) {
  const site_t &site = decisions->site();
  i32 index = 0;
  if (pass_through >= sink_only && is_walkable<i32>(platform_audio)) {
    for (const auto &value : walk<const i32>(LIST_AS(site, &platform_audio)))
      audio_verdict_t(decisions, COMPOSE_ORIGIN_PLATFORM_AUDIO, index++).ignored(type_of(value), pass_through);
  }
  if (pass_through <= platform_only && is_walkable<short_audio_desc_t>(sink_audio)) {
    for (const auto &audio : walk<const short_audio_desc_t>(LIST_AS(site, &sink_audio)))
      audio_verdict_t(decisions, COMPOSE_ORIGIN_SINK_AUDIO, index++).ignored(audio.type, pass_through);
  }
}

void note_masked_format(decisions_t *decisions, u32 position, u32 bit, u32 mask) {
  compose_decision_t *const decision = decisions->chosen(COMPOSE_SUBJECT_AUDIO_FORMAT, position);
  if (decision == nullptr) return;
  if (bit == 0) {
    decide(decision, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_TYPE_WITHOUT_BIT, reason_values(mask));
  } else {
    decide(decision, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_AUDIO_MASK, reason_values(mask, bit));
  }
}

void note_basic_audio(decisions_t *decisions, const short_audio_desc_t &audio) {
  compose_decision_t *const decision = decisions->add(COMPOSE_SUBJECT_AUDIO_FORMAT, audio.type);
  decision->origins = COMPOSE_ORIGIN_LIBRARY;
  decide(decision, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_BASIC_AUDIO, reason_values(audio.channels));
}

}  // namespace edid_composer

#include "edid_composer/explain/audio_explanation.h"

#include "edid_composer/selection/audio_formats.h"
#include "edid_decode_encode/short_audio.h"
#include "linked_list/typed_list.h"

namespace edid_composer {
namespace {

/// Never reports: the lists were found to be walkable.
REPORTS_AS(_filter_audio_formats);

compose_verdict verdict_of(compose_reason reason) {
  switch (reason) {
    case COMPOSE_REASON_PLATFORM_FORMAT:
    case COMPOSE_REASON_SINK_FORMAT:
    case COMPOSE_REASON_BASIC_AUDIO:
      return COMPOSE_VERDICT_OFFERED;
    case COMPOSE_REASON_NARROWED_TO_SINK:
      return COMPOSE_VERDICT_CHANGED;
    default:
      return COMPOSE_VERDICT_LEFT_OUT;
  }
}

/// Each format of a list is a candidate of its own.
compose_decision_t *add_format(compose_origin origin, i32 index, u32 type, decisions_t *decisions) {
  compose_decision_t *const decision = decisions->add(COMPOSE_SUBJECT_AUDIO_FORMAT, type);
  decision->origins = origin;
  if (origin == COMPOSE_ORIGIN_SINK_AUDIO) decision->sink_index = index;
  if (origin == COMPOSE_ORIGIN_PLATFORM_AUDIO) decision->priority_index = index;
  return decision;
}

void add_formats(compose_origin origin, const journal_t &journal, decisions_t *decisions) {
  for (const journal_entry_t &entry : journal.entries()) {
    if (entry.subject != COMPOSE_SUBJECT_AUDIO_FORMAT || entry.origin != origin) continue;
    decide(add_format(origin, entry.index, entry.code, decisions), verdict_of(entry.reason), entry.reason,
           entry.values);
  }
}

/// The type of a platform format. It is not decoded, as one that can't be is reported then.
u32 type_of(i32 platform_format) {
  const auto bytes = static_cast<u32>(platform_format);
  return short_audio_type(static_cast<u8>(bytes & 0xFF), static_cast<u8>(bytes >> 16 & 0xFF));
}

/// The formats of the side that the pass-through setting leaves out.
void add_ignored_formats(const inputs_t &inputs, decisions_t *decisions) {
  const i32 pass_through = inputs.platform.audio_pass_through;
  const ll_list_t &platform_audio = inputs.platform.audio_list;
  const ll_list_t &sink_audio = inputs.sink.audio_list;
  const auto ignore = [&](compose_origin origin, i32 index, u32 type, compose_reason reason) {
    decide(add_format(origin, index, type, decisions), COMPOSE_VERDICT_LEFT_OUT, reason, reason_values(pass_through));
  };
  i32 index = 0;
  if (pass_through >= sink_only && is_walkable<i32>(platform_audio)) {
    for (const i32 value : walk<const i32>(LIST(&platform_audio, "&platform_audio")))
      ignore(COMPOSE_ORIGIN_PLATFORM_AUDIO, index++, type_of(value), COMPOSE_REASON_SINK_FORMATS_ONLY);
  }
  if (pass_through <= platform_only && is_walkable<short_audio_desc_t>(sink_audio)) {
    for (const auto &audio : walk<const short_audio_desc_t>(LIST(&sink_audio, "&sink_audio")))
      ignore(COMPOSE_ORIGIN_SINK_AUDIO, index++, audio.type, COMPOSE_REASON_PLATFORM_FORMATS_ONLY);
  }
}

/// The formats that the audio mask has taken out again; both they and the chosen ones stand in the order of their
/// places.
void leave_out_masked_formats(const journal_t &journal, const decisions_t &decisions) {
  auto decision = decisions.all().begin();
  i32 place = 0;
  for (const journal_entry_t &entry : journal.entries()) {
    if (entry.subject != COMPOSE_SUBJECT_AUDIO_FORMAT || entry.origin != 0) continue;
    for (; decision != decisions.all().end(); ++decision) {
      const bool chosen = decision->subject == COMPOSE_SUBJECT_AUDIO_FORMAT && is_chosen(*decision);
      if (chosen && place++ == entry.index) break;
    }
    if (decision != decisions.all().end()) decide(&*decision, COMPOSE_VERDICT_LEFT_OUT, entry.reason, entry.values);
  }
}

}  // namespace

void explain_audio_formats(const inputs_t &inputs, const journal_t &journal, decisions_t *decisions) {
  add_formats(COMPOSE_ORIGIN_PLATFORM_AUDIO, journal, decisions);
  add_formats(COMPOSE_ORIGIN_SINK_AUDIO, journal, decisions);
  add_ignored_formats(inputs, decisions);
  leave_out_masked_formats(journal, *decisions);
  add_formats(COMPOSE_ORIGIN_LIBRARY, journal, decisions);
}

}  // namespace edid_composer

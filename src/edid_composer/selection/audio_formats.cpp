#include "edid_composer/selection/audio_formats.h"

#include "edid_composer/selection/audio_mask.h"
#include "edid_composer/selection/audio_matching.h"
#include "linked_list/typed_list.h"
#include "output.h"

namespace edid_composer {
namespace {

REPORTS_AS(_filter_audio_formats);

void trace_audio(const char *label, const short_audio_desc_t &audio) {
  if (!is_tracing()) return;
  log_trace(site, __LINE__, "%s", label);
  print_audio_structure(&audio);
}

/// What becomes of one format.
struct format_outcome_t {
  bool chosen;
  short_audio_desc_t audio;
  compose_reason reason;
  reason_values_t values;
};

format_outcome_t left_out(const short_audio_desc_t &audio, compose_reason reason, reason_values_t values) {
  return {false, audio, reason, values};
}

bool same_format(const short_audio_desc_t &a, const short_audio_desc_t &b) {
  return a.channels == b.channels && a.frequencies == b.frequencies && a.pcm_bits == b.pcm_bits &&
         a.max_bitrate == b.max_bitrate && a.value == b.value && a.wma_profile == b.wma_profile;
}

/// A platform format: the three bytes of a short audio descriptor, byte 1 lowest.
bool decode_platform_format(i32 value, short_audio_desc_t *audio) {
  const auto bytes = static_cast<u32>(value);
  return decode_edid_short_audio(static_cast<u8>(bytes & 0xFF), static_cast<u8>(bytes >> 8 & 0xFF),
                                 static_cast<u8>(bytes >> 16 & 0xFF), audio) == 1;
}

format_outcome_t judge_platform_format(const inputs_t &inputs, i32 value, const ll_list_t &formats) {
  short_audio_desc_t asked_for{};
  if (!decode_platform_format(value, &asked_for)) {
    LOG_WARNING("Failed decoding audio format. Val:0x%06X", static_cast<u32>(value));
    return left_out({}, COMPOSE_REASON_NOT_AN_AUDIO_FORMAT, reason_values(value));
  }
  trace_audio("\t\t", asked_for);
  short_audio_desc_t audio = asked_for;
  if (inputs.settings.audio_sink_filter == 1) {
    const std::optional<short_audio_desc_t> narrowed = _audio_format_in_downstream_sink(&inputs.sink, asked_for);
    if (!narrowed) {
      LOG_TRACE("\t\tFormat not in downstream as requested. Ignoring");
      return left_out(asked_for, COMPOSE_REASON_NOT_IN_SINK, reason_values(asked_for.channels));
    }
    audio = *narrowed;
  }
  if (const std::optional<i32> place = _audio_format_in_list(&formats, audio)) {
    LOG_TRACE("\t\tFormat is a duplicate. Ignoring.");
    return left_out(audio, COMPOSE_REASON_DUPLICATE, reason_values(audio.channels, *place));
  }
  if (same_format(audio, asked_for)) {
    return {true, audio, COMPOSE_REASON_PLATFORM_FORMAT, reason_values(audio.channels)};
  }
  return {true, audio, COMPOSE_REASON_NARROWED_TO_SINK,
          reason_values(asked_for.channels, audio.channels, asked_for.frequencies, audio.frequencies)};
}

/// The sink's formats as they are: neither filtered nor narrowed.
format_outcome_t judge_sink_format(const inputs_t &inputs, const short_audio_desc_t &audio, const ll_list_t &formats) {
  trace_audio("\t\t", audio);
  if (inputs.platform.audio_pass_through == platform_and_sink) {
    if (const std::optional<i32> place = _audio_format_in_list(&formats, audio)) {
      LOG_TRACE("\t\t -->Format is a duplicate. Ignoring.");
      return left_out(audio, COMPOSE_REASON_DUPLICATE, reason_values(audio.channels, *place));
    }
  }
  trace_audio("\t\t -->Adding mode.\n", audio);
  return {true, audio, COMPOSE_REASON_SINK_FORMAT, reason_values(audio.channels)};
}

void note(compose_origin origin, i32 index, const format_outcome_t &outcome, journal_t *journal) {
  journal->note({.subject = COMPOSE_SUBJECT_AUDIO_FORMAT,
                 .origin = origin,
                 .index = index,
                 .code = outcome.audio.type,
                 .reason = outcome.reason,
                 .values = outcome.values});
}

bool add_platform_formats(const inputs_t &inputs, ll_list_t *formats, journal_t *journal) {
  appender_t<short_audio_desc_t> chosen(formats, inputs.arena, site);
  i32 index = 0;
  LOG_TRACE("\tReading the platform audio modes:");
  for (const auto &value : walk<const i32>(LIST(&inputs.platform.audio_list, "&platform_values->audio_list"))) {
    const format_outcome_t outcome = judge_platform_format(inputs, value, *formats);
    note(COMPOSE_ORIGIN_PLATFORM_AUDIO, index++, outcome, journal);
    if (outcome.chosen && !chosen.append(outcome.audio)) return false;
  }
  return true;
}

bool add_sink_formats(const inputs_t &inputs, ll_list_t *formats, journal_t *journal) {
  appender_t<short_audio_desc_t> chosen(formats, inputs.arena, site);
  i32 index = 0;
  LOG_TRACE("\tExamining downstream audio formats:");
  for (const auto &audio : walk<const short_audio_desc_t>(LIST(&inputs.sink.audio_list, "&edid->audio_list"))) {
    const format_outcome_t outcome = judge_sink_format(inputs, audio, *formats);
    note(COMPOSE_ORIGIN_SINK_AUDIO, index++, outcome, journal);
    if (outcome.chosen && !chosen.append(outcome.audio)) return false;
  }
  return true;
}

bool ensure_basic_audio(ll_list_t *formats, entry_arena_t *arena, journal_t *journal) {
  for (const auto &audio : walk<const short_audio_desc_t>(LIST(formats, "formats"))) {
    LOG_TRACE("\tEntry:%d Channels:%d", audio.type, audio.channels);
    if (is_basic_audio(audio)) {
      LOG_TRACE("\tFound a \"basic audio\" PCM 2-chan entry.");
      return true;
    }
  }
  LOG_TRACE("\tNo \"basic audio\" PCM 2-chan entry found. Adding one.");
  constexpr short_audio_desc_t basic{.type = audio_pcm,
                                     .channels = 2,
                                     .frequencies = 0x07,  // 32, 44.1 and 48 kHz
                                     .pcm_bits = 0x05,     // 16 and 24 bit
                                     .max_bitrate = 0,
                                     .value = 0,
                                     .wma_profile = 0};
  if (!appender_t<short_audio_desc_t>(formats, arena, site).prepend(basic)) return false;
  journal->note({.subject = COMPOSE_SUBJECT_AUDIO_FORMAT,
                 .origin = COMPOSE_ORIGIN_LIBRARY,
                 .code = basic.type,
                 .reason = COMPOSE_REASON_BASIC_AUDIO,
                 .values = reason_values(basic.channels)});
  if (is_tracing()) {
    print("\t");
    print_audio_structure(&basic);
  }
  return true;
}

}  // namespace

bool _filter_audio_formats(const inputs_t &inputs, ll_list_t *formats, journal_t *journal) {
  const bool sink_filter = inputs.settings.audio_sink_filter == 1;
  const i32 pass_through = inputs.platform.audio_pass_through;
  LOG_TRACE("Create Audio mode list:");
  LOG_TRACE("\tExamining platform audio formats:");
  LOG_TRACE("\tSink Filter is turned %s", sink_filter ? "ON" : "OFF");
  LOG_TRACE("\tPassThrough Mode:%d", pass_through);

  if (pass_through < sink_only && !add_platform_formats(inputs, formats, journal)) return false;
  if (pass_through > platform_only && !add_sink_formats(inputs, formats, journal)) return false;
  u32 mask = inputs.settings.audio_mask;
  if (sink_filter) mask &= _create_audio_mask(&inputs.sink.audio_list);
  _filter_audio_list_with_mask(formats, mask, inputs.arena, journal);
  return ensure_basic_audio(formats, inputs.arena, journal);
}

}  // namespace edid_composer

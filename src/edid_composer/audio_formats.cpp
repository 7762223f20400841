#include "edid_composer/audio_formats.h"

#include "diagnostics.h"
#include "edid_composer/audio_verdicts.h"
#include "linked_list/new_entry.h"
#include "linked_list/walk.h"
#include "output.h"

namespace edid_composer {
namespace {

constexpr u32 pcm = 1;

void trace_audio(const site_t &site, const char *label, const short_audio_desc_t &audio) {
  if (!debug_enabled()) return;
  log_trace(HERE_AS(site), "%s", label);
  print_audio_structure(&audio);
}

/// A platform format: the three bytes of a short audio descriptor, byte 1 lowest.
bool decode_platform_format(i32 value, short_audio_desc_t *audio) {
  const auto bytes = static_cast<u32>(value);
  return decode_edid_short_audio(static_cast<u8>(bytes & 0xFF), static_cast<u8>(bytes >> 8 & 0xFF),
                                 static_cast<u8>(bytes >> 16 & 0xFF), audio) == 1;
}

bool add_platform_formats(const site_t &site, const edid_t *edid, bool sink_filter,
                          const platform_values_t *platform_values, ll_list_t *ret_list, decisions_t *decisions) {
  i32 index = 0;
  LOG_TRACE_AS(site, "\tReading the platform audio modes:");
  for (const auto &value : walk<const i32>(LIST_AS(site, &platform_values->audio_list))) {
    audio_verdict_t verdict(decisions, COMPOSE_ORIGIN_PLATFORM_AUDIO, index++);
    short_audio_desc_t audio{};
    if (!decode_platform_format(value, &audio)) {
      verdict.not_a_format(value);
      LOG_WARNING_AS(site, "Failed decoding audio format. Val:0x%06X", static_cast<u32>(value));
      continue;
    }
    trace_audio(site, "\t\t", audio);
    verdict.format(audio);
    if (sink_filter && _audio_format_in_downstream_sink(edid, &audio) != 1) {
      LOG_TRACE_AS(site, "\t\tFormat not in downstream as requested. Ignoring");
      verdict.not_in_sink();
      continue;
    }
    if (_audio_format_in_list(ret_list, &audio) == 1) {
      LOG_TRACE_AS(site, "\t\tFormat is a duplicate. Ignoring.");
      verdict.duplicate(*ret_list, audio);
      continue;
    }
    if (!append(ret_list, audio, HERE_AS(site))) return false;
    verdict.chosen(audio);
  }
  return true;
}

/// The sink's formats as they are: neither filtered nor narrowed.
bool add_sink_formats(const site_t &site, const edid_t *edid, i32 pass_through, ll_list_t *ret_list,
                      decisions_t *decisions) {
  i32 index = 0;
  LOG_TRACE_AS(site, "\tExamining downstream audio formats:");
  for (const auto &audio : walk<const short_audio_desc_t>(LIST_AS(site, &edid->audio_list))) {
    audio_verdict_t verdict(decisions, COMPOSE_ORIGIN_SINK_AUDIO, index++);
    verdict.format(audio);
    trace_audio(site, "\t\t", audio);
    if (pass_through == platform_and_sink && _audio_format_in_list(ret_list, &audio) == 1) {
      LOG_TRACE_AS(site, "\t\t -->Format is a duplicate. Ignoring.");
      verdict.duplicate(*ret_list, audio);
      continue;
    }
    trace_audio(site, "\t\t -->Adding mode.\n", audio);
    if (!append(ret_list, audio, HERE_AS(site))) return false;
    verdict.chosen(audio);
  }
  return true;
}

/// Basic audio (CEA-861, section 7.5.2): 2-channel PCM at 32, 44.1 or 48 kHz.
bool is_basic_audio(const short_audio_desc_t &audio) {
  constexpr u32 basic_rates = 0x07;
  return audio.type == pcm && audio.channels == 2 && (audio.frequencies & basic_rates) != 0;
}

bool ensure_basic_audio(const site_t &site, ll_list_t *ret_list, decisions_t *decisions) {
  for (const auto &audio : walk<const short_audio_desc_t>(LIST_AS(site, ret_list))) {
    LOG_TRACE_AS(site, "\tEntry:%d Channels:%d", audio.type, audio.channels);
    if (is_basic_audio(audio)) {
      LOG_TRACE_AS(site, "\tFound a \"basic audio\" PCM 2-chan entry.");
      return true;
    }
  }
  LOG_TRACE_AS(site, "\tNo \"basic audio\" PCM 2-chan entry found. Adding one.");
  new_entry_t<short_audio_desc_t> basic(HERE_AS(site));
  if (!basic) return false;
  basic->type = pcm;
  basic->channels = 2;
  basic->frequencies = 0x07;  // 32, 44.1 and 48 kHz
  basic->pcm_bits = 0x05;     // 16 and 24 bit
  // kept: the words for the back of the list.
  if (!basic.add_to_front(ret_list)) return false;
  if (decisions != nullptr) note_basic_audio(decisions, *basic);
  if (debug_enabled()) {
    print("\t");
    print_audio_structure(&*basic);
  }
  return true;
}

/// Tells whether the sink's format has room for the platform's. @p pcm_bits receives the sample sizes of both.
bool sink_format_matches(const short_audio_desc_t &sink, const short_audio_desc_t &audio, u32 *pcm_bits) {
  if (sink.type != audio.type || (sink.frequencies & audio.frequencies) == 0) return false;
  *pcm_bits = audio.pcm_bits;
  if (audio.type != pcm) return true;
  const bool both_stereo = sink.channels == 2 && audio.channels == 2;
  const bool both_multichannel = sink.channels > 2 && audio.channels > 2;
  *pcm_bits = sink.pcm_bits & audio.pcm_bits;
  return (both_stereo || both_multichannel) && *pcm_bits != 0;
}

u32 smaller_signed(u32 a, u32 b) {
  return static_cast<i32>(a) < static_cast<i32>(b) ? a : b;
}

}  // namespace

u32 _filter_audio_formats(const edid_t *edid, u32 audio_mask, u8 audio_sink_filter, ll_list_t *ret_list,
                          const platform_values_t *platform_values, decisions_t *decisions) {
  const bool sink_filter = audio_sink_filter == 1;
  const i32 pass_through = platform_values->audio_pass_through;
  LOG_TRACE("Create Audio mode list:");
  LOG_TRACE("\tExamining platform audio formats:");
  LOG_TRACE("\tSink Filter is turned %s", sink_filter ? "ON" : "OFF");
  LOG_TRACE("\tPassThrough Mode:%d", pass_through);

  if (pass_through < sink_only &&
      !add_platform_formats(HERE, edid, sink_filter, platform_values, ret_list, decisions)) {
    return 0;
  }
  if (pass_through > platform_only && !add_sink_formats(HERE, edid, pass_through, ret_list, decisions)) return 0;
  if (decisions != nullptr)
    note_ignored_formats(decisions, pass_through, platform_values->audio_list, edid->audio_list);
  if (sink_filter) audio_mask &= _create_audio_mask(&edid->audio_list);
  _filter_audio_list_with_mask(ret_list, audio_mask, decisions);
  return ensure_basic_audio(HERE, ret_list, decisions) ? 1 : 0;
}

bool _covers(const short_audio_desc_t &entry, const short_audio_desc_t &audio) {
  // A PCM entry covers fewer channels, not more.
  return entry.type == audio.type && (entry.type != pcm || entry.channels >= audio.channels);
}

u32 _audio_format_in_list(const ll_list_t *audio_list, const short_audio_desc_t *audio) {
  for (const auto &entry : walk<const short_audio_desc_t>(LIST(audio_list))) {
    if (_covers(entry, *audio)) return 1;
  }
  return 0;
}

u32 _audio_format_in_downstream_sink(const edid_t *edid, short_audio_desc_t *audio) {
  for (const auto &sink : walk<const short_audio_desc_t>(LIST(&edid->audio_list))) {
    u32 pcm_bits = 0;
    if (!sink_format_matches(sink, *audio, &pcm_bits)) continue;
    audio->pcm_bits = pcm_bits;
    audio->frequencies &= sink.frequencies;
    audio->channels = smaller_signed(audio->channels, sink.channels);
    audio->max_bitrate = smaller_signed(audio->max_bitrate, sink.max_bitrate);
    audio->value = smaller_signed(audio->value, sink.value);
    audio->wma_profile = smaller_signed(audio->wma_profile, sink.wma_profile);
    return 1;
  }
  return 0;
}

u32 _audio_type_to_audio_mask(u32 type) {
  // Type 15, the extension escape, has no bit: the types behind it take the bits that follow type 14's.
  if (type >= 1 && type <= 14) return 1U << (type - 1);
  if (type >= 16 && type <= 18) return 1U << (type - 2);
  return 0;
}

u32 _create_audio_mask(const ll_list_t *list) {
  u32 mask = 0;
  for (const auto &audio : walk<const short_audio_desc_t>(LIST(list)))
    mask |= _audio_type_to_audio_mask(audio.type);
  return mask;
}

void _filter_audio_list_with_mask(ll_list_t *list, u32 mask, decisions_t *decisions) {
  LOG_TRACE("\tMask:0x%08X", mask);
  LOG_TRACE("%s() - Printing reverse formats\n", static_cast<const char *>(__func__));
  // From the back, so that the positions in front of a deleted entry stay what they are.
  // kept: the first entry is never examined.
  for (i32 position = ll_size(list) - 1; position > 0; --position) {
    void *payload = nullptr;
    if (!ll_entry_at(list, position, &payload)) {
      LOG_BUG("Failed trying to retrieve index:%d\n", position);
      return;
    }
    const auto &audio = *static_cast<const short_audio_desc_t *>(payload);
    trace_audio(HERE, "\t\tFormat:", audio);
    const u32 bit = _audio_type_to_audio_mask(audio.type);
    if ((bit & mask) != 0) continue;
    if (!ll_delete_entry_at(list, static_cast<u32>(position))) {
      LOG_BUG("Failed trying to delete entry");
      return;
    }
    if (decisions != nullptr) note_masked_format(decisions, static_cast<u32>(position), bit, mask);
  }
}

}  // namespace edid_composer

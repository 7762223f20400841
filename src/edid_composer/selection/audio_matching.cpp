#include "edid_composer/selection/audio_matching.h"

#include "linked_list/typed_list.h"

namespace edid_composer {
namespace {

/// True when an entry makes a further format superfluous.
bool covers(const short_audio_desc_t &entry, const short_audio_desc_t &audio) {
  // A PCM entry covers fewer channels, not more.
  return entry.type == audio.type && (entry.type != audio_pcm || entry.channels >= audio.channels);
}

/// True when the sink's format has room for the platform's.
bool matches(const short_audio_desc_t &sink, const short_audio_desc_t &audio) {
  if (sink.type != audio.type || (sink.frequencies & audio.frequencies) == 0) return false;
  if (audio.type != audio_pcm) return true;
  const bool both_stereo = sink.channels == 2 && audio.channels == 2;
  const bool both_multichannel = sink.channels > 2 && audio.channels > 2;
  return (both_stereo || both_multichannel) && (sink.pcm_bits & audio.pcm_bits) != 0;
}

u32 smaller_signed(u32 a, u32 b) {
  return static_cast<i32>(a) < static_cast<i32>(b) ? a : b;
}

short_audio_desc_t narrowed(const short_audio_desc_t &audio, const short_audio_desc_t &sink) {
  return {.type = audio.type,
          .channels = smaller_signed(audio.channels, sink.channels),
          .frequencies = audio.frequencies & sink.frequencies,
          .pcm_bits = audio.type == audio_pcm ? audio.pcm_bits & sink.pcm_bits : audio.pcm_bits,
          .max_bitrate = smaller_signed(audio.max_bitrate, sink.max_bitrate),
          .value = smaller_signed(audio.value, sink.value),
          .wma_profile = smaller_signed(audio.wma_profile, sink.wma_profile)};
}

}  // namespace

std::optional<i32> _audio_format_in_list(const ll_list_t *audio_list, const short_audio_desc_t &audio) {
  REPORTS_AS(_audio_format_in_list);
  i32 place = 0;
  for (const auto &entry : walk<const short_audio_desc_t>(LIST(audio_list, "audio_list"))) {
    if (covers(entry, audio)) return place;
    ++place;
  }
  return std::nullopt;
}

std::optional<short_audio_desc_t> _audio_format_in_downstream_sink(const edid_t *edid,
                                                                   const short_audio_desc_t &audio) {
  REPORTS_AS(_audio_format_in_downstream_sink);
  for (const auto &sink : walk<const short_audio_desc_t>(LIST(&edid->audio_list, "&edid->audio_list"))) {
    if (matches(sink, audio)) return narrowed(audio, sink);
  }
  return std::nullopt;
}

bool is_basic_audio(const short_audio_desc_t &audio) {
  constexpr u32 basic_rates = 0x07;
  return audio.type == audio_pcm && audio.channels == 2 && (audio.frequencies & basic_rates) != 0;
}

}  // namespace edid_composer

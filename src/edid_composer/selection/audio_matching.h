// Which audio formats cover and match each other.
#pragma once

#include <optional>

#include "edid_composer.h"

namespace edid_composer {

inline constexpr u32 audio_pcm = 1;

/// Place of the first entry that makes the format superfluous; nothing when it is new.
std::optional<i32> _audio_format_in_list(const ll_list_t *audio_list, const short_audio_desc_t &audio);

/// The format narrowed to what the sink's first format like it takes; nothing when the sink has none.
std::optional<short_audio_desc_t> _audio_format_in_downstream_sink(const edid_t *edid, const short_audio_desc_t &audio);

/// Basic audio (CEA-861, section 7.5.2): 2-channel PCM at 32, 44.1 or 48 kHz.
bool is_basic_audio(const short_audio_desc_t &audio);

}  // namespace edid_composer

// Audio formats as the platform's file holds them: the three bytes of a short audio descriptor, byte 1 lowest.
#pragma once

#include <optional>
#include <string>

#include "explain/explained.h"
#include "explain/wanted.h"

namespace edid_cli {

inline constexpr u32 pcm_type = 1;

struct audio_entry_t {
  u32 value = 0;
  std::string remark;  ///< What it is, and whose.
};

/// None for what is no audio format.
std::optional<short_audio_desc_t> decoded_audio_entry(u32 value);

/// The sink's descriptor of what is wanted, with the most channels; none when it has none, or was not read.
std::optional<u32> sink_audio_entry(const wanted_t &wanted, const explained_t &explained);

/// The sink's own, else the default platform's, else a usual one. Loads the default platform for a moment: what the
/// configuration store held has to be loaded again.
audio_entry_t proposed_audio_entry(const wanted_t &wanted, const explained_t &explained);

}  // namespace edid_cli

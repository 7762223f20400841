// The latencies that the new EDID declares: the platform's own and the sink's, in sum.
#pragma once

#include <iterator>

#include "edid_composer/inputs.h"

namespace edid_composer {

struct latency_t {
  u16 own_ms;
  u16 sink_ms;
  u16 sum_ms;
  compose_reason reason;
};

/// In the order of compose_cfg_t::edid_latency.
inline constexpr u16 edid_t::*latency_fields[] = {&edid_t::video_latency, &edid_t::audio_latency,
                                                  &edid_t::i_video_latency, &edid_t::i_audio_latency};
inline constexpr u32 latency_count = static_cast<u32>(std::size(latency_fields));

/// @p which is the place in latency_fields.
latency_t add_latencies(const inputs_t &inputs, u32 which);

}  // namespace edid_composer

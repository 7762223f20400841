#include "edid_composer/new_edid/latencies.h"

namespace edid_composer {

latency_t add_latencies(const inputs_t &inputs, u32 which) {
  constexpr u16 longest_ms = 500;
  constexpr u16 not_valid = 65535;
  const auto own_ms = static_cast<u16>(inputs.settings.edid_latency[which] & 0xFFFF);
  const u16 sink_ms = inputs.sink.*latency_fields[which];
  if (own_ms > longest_ms || sink_ms > longest_ms) {
    return {own_ms, sink_ms, not_valid, COMPOSE_REASON_LATENCY_TOO_LONG};
  }
  const auto sum_ms = static_cast<u16>(own_ms + sink_ms);
  return {own_ms, sink_ms, sum_ms, sum_ms == 0 ? COMPOSE_REASON_LATENCY_NONE : COMPOSE_REASON_LATENCY_OF_BOTH};
}

}  // namespace edid_composer

#include "edid_composer/hdmi2/link_rates.h"

#include <algorithm>

namespace edid_composer {
namespace {

constexpr u32 rate_unit = 5;

u32 rate_of_sink(const layer_inputs_t &inputs, u32 rate_of_platform) {
  constexpr u32 of_single_link = 165;
  if (!inputs.has_sink || inputs.base.platform.is_tv != 0) return rate_of_platform;
  if (inputs.sink.max_tmds_rate > 0) return inputs.sink.max_tmds_rate;
  if (inputs.base.sink.max_tmds_clock > 0) return inputs.base.sink.max_tmds_clock;
  return of_single_link;
}

}  // namespace

link_rates_t link_rates(const layer_inputs_t &inputs) {
  const u32 platform = up_to_multiple(static_cast<u32>(inputs.platform.tmds_limit), rate_unit);
  const u32 sink = rate_of_sink(inputs, platform);
  return {platform, sink, std::min(platform, sink) / rate_unit * rate_unit};
}

}  // namespace edid_composer

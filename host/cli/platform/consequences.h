// What comes of a platform in front of no sink, of a sink that takes everything, and of given ones.
#pragma once

#include <span>

#include "platform/configuration_readings.h"
#include "platform/finding.h"

namespace edid_cli {

struct named_sink_t {
  std::string name;
  std::vector<u8> edid;
};

/// Each problem once, however many of the compositions have it, with the first of them. @p without_sink is the
/// composition without a sink from the same settings. Decoding the sinks prints what the library has to say.
findings_t find_consequences(const composition_t &without_sink, const compose_cfg_t &settings,
                             std::span<const named_sink_t> sinks);

}  // namespace edid_cli

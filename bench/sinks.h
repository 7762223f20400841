// The sinks that are measured.
#pragma once

#include <string>
#include <vector>

#include "support/edid_builder.h"

namespace bench {

using test_support::bytes_t;

struct sink_t {
  std::string name;
  bytes_t bytes;

  const u8 *data() const { return bytes.data(); }
  u32 size() const { return static_cast<u32>(bytes.size()); }
};

/// Those of examples/sinks, by name.
const std::vector<sink_t> &sample_sinks();

/// A sink with @p count short video descriptors, VICs 1 to 64 and over again; at most 80.
sink_t sink_with_video(u32 count);

/// A sink with 64 short video descriptors, one for each VIC.
sink_t sink_with_every_vic();

/// A sink with 16 short video and @p count short audio descriptors, of the types that take one each; at most 18.
sink_t sink_with_audio(u32 count);

}  // namespace bench

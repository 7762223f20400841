// Sinks at random.
#pragma once

#include <vector>

#include "random_source.h"
#include "support/edid_builder.h"
#include "support/records.h"

namespace properties {

/// A well-formed sink.
struct random_sink_t {
  test_support::bytes_t bytes;
  std::vector<detailed_timing_t> timings;  ///< Those of the base block first.
  std::vector<u32> timing_vics;            ///< The VIC of each of them, 0 where it has none.
  std::vector<std_timing_t> std_timings;
  std::vector<test_support::mode_pair_t> video;
  std::vector<u32> audio_types;
  std::vector<u32> hdmi_vics;
  bool has_3d = false;
};

random_sink_t random_sink(random_source_t &random);

/// Two blocks of anything after a valid header, or a well-formed sink with some bytes changed; with right checksums
/// mostly. From none to four blocks.
test_support::bytes_t random_bytes_of_a_sink(random_source_t &random);

/// A VIC from 1 to @p last; mostly one of those that sinks and platforms name often, so that they meet.
u32 random_vic(random_source_t &random, u32 last);

}  // namespace properties

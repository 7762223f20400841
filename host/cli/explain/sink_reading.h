// What the library has read of the sink's EDID, and what not: everything said of a sink rests on it.
#pragma once

#include <string>
#include <vector>

#include "composition/composition.h"

namespace edid_cli {

/// A block of the sink's EDID.
struct sink_block_t {
  std::size_t number = 0;
  std::string kind;  ///< "DisplayID extension".
  bool is_read = false;
};

struct sink_reading_t {
  bool is_given = false;
  u32 base_status = 0;       ///< compose_sink_status.
  u32 extension_status = 0;  ///< compose_extension_status.
  std::vector<sink_block_t> blocks;
  /// What was not read, and why: a sentence for each part. None: all of it was read.
  std::vector<std::string> gaps;
  /// The part that is missing, as in "the sink's extension was not read"; empty when nothing is.
  std::string missing_part;
  /// How many detailed timings the base block and block 1 hold. The library takes later bytes for further ones.
  std::size_t detailed_timings = 0;
  /// The same of the base block alone.
  std::size_t base_timings = 0;
  /// Block 1's short audio descriptors, in order, byte 1 lowest.
  std::vector<u32> short_audio;

  /// Whether what the sink takes is not known, so that nothing can be advised for it.
  bool is_incomplete() const { return !missing_part.empty(); }
};

sink_reading_t sink_reading(const std::vector<u8> &sink, const composition_t &composition);

/// The sink as the stages of a composition see it: with HDMI 2, its base block and the first extension that can be
/// read.
std::vector<u8> sink_of_stages(const std::vector<u8> &sink, const composition_t &composition);

}  // namespace edid_cli

// The compositions whose outcome is kept. A case is a file of hexadecimal text in tests/end_to_end/golden: its first
// two lines say sink, platform and settings, the rest what is composed from them.
//
// Between them the cases have each 3D mode; latencies that are none, that are added to the sink's and that are too
// long; masks that let everything, something and nothing through; current modes that are offered already, that are not,
// and that have no video identification code.
#pragma once

#include <array>
#include <string>
#include <vector>

#include "edid_composer.h"

namespace golden {

struct golden_case_t {
  std::string sink;      ///< A file of examples/sinks, without its ending.
  std::string platform;  ///< "default", or a file of examples/platforms, without its ending.
  u32 port = 0;
  std::array<u32, 4> latency_ms{};  ///< Video, audio, interlaced video, interlaced audio.
  i32 hdmi_3d_mode = 0;
  u32 audio_mask = 0;
  bool audio_sink_filter = false;
  video_mode_t current_mode{};

  /// Which is how its files are called, in front of their endings.
  std::string name() const { return sink + "." + platform; }
  /// The two lines.
  std::string heading() const;
};

/// The case that begins with the two lines. Throws std::runtime_error when it doesn't.
golden_case_t case_of(const std::string &text);

/// Those of the directory of the goldens, by name.
const std::vector<golden_case_t> &golden_cases();

}  // namespace golden

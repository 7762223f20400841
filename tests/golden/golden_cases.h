// The compositions whose outcome is kept: every sample sink behind three platforms, with the settings of each.
#pragma once

#include <array>
#include <string>
#include <vector>

#include "edid_composer.h"

namespace golden {

struct golden_case_t {
  const char *sink;      ///< A file of examples/sinks, without its ending.
  const char *platform;  ///< "default", or a file of examples/platforms, without its ending.
  u32 port;
  std::array<u32, 4> latency_ms;  ///< Video, audio, interlaced video, interlaced audio.
  i32 hdmi_3d_mode;
  u32 audio_mask;
  bool audio_sink_filter;
  video_mode_t current_mode;

  /// Which is how its files are called, in front of their endings.
  std::string name() const { return std::string(sink) + "." + platform; }
  /// The settings as one line.
  std::string settings() const;
};

const std::vector<golden_case_t> &golden_cases();

}  // namespace golden

// Everything that a composition depends on.
#pragma once

#include <optional>
#include <set>
#include <string>

#include "edid_composer.h"

namespace edid_cli {

/// compose_cfg_t::hdmi_3d_mode.
inline constexpr i32 no_3d_mode = 0;
inline constexpr i32 follow_sink_3d_mode = 1;
inline constexpr i32 always_3d_mode = 2;

/// compose_cfg_t::audio_mask.
inline constexpr u32 all_audio_formats = 0xFFFFFFFF;

/// Every audio format, 3D as the sink has it, no latency.
inline compose_cfg_t default_settings() {
  compose_cfg_t settings{};
  settings.audio_mask = all_audio_formats;
  settings.hdmi_3d_mode = follow_sink_3d_mode;
  return settings;
}

/// Inputs of the platform, from the first to the last.
struct port_range_t {
  u32 first = 0;
  u32 last = 0;
  bool is_range = false;  ///< Written as a range, also if of one port.
};

/// File names may be standard_stream ("-").
struct composition_options_t {
  std::optional<std::string> platform_file;  ///< None: the default platform.
  std::optional<std::string> sink;           ///< A file, a folder or a connector. None: no sink.
  std::string drm_directory;
  port_range_t ports;
  compose_cfg_t settings = default_settings();  ///< The port is set for each composition.
  std::set<std::string> given;  ///< Names of the settings that the command line has, such as "audio-mask".
  bool debug = false;
};

}  // namespace edid_cli

#include "composition_arguments.h"

#include <algorithm>

#include "bad_input.h"
#include "drm_connectors.h"
#include "input.h"
#include "parsed_option.h"
#include "video_mode_text.h"

namespace edid_cli {

void add_drm_directory(CLI::App &command, std::string &directory) {
  directory = default_drm_directory;
  add_parsed_option(command, "--drm-dir", directory, parse_file_name,
                    std::string("Where the connectors are looked for (default ") + default_drm_directory + ")")
      ->type_name("DIR")
      ->envname("EDID_COMPOSER_DRM_DIR");
}

composition_arguments_t::composition_arguments_t(CLI::App &command) {
  options_.settings.audio_mask = 0xFFFFFFFF;
  options_.settings.hdmi_3d_mode = follow_sink_3d_mode;
  add_inputs(command);
  add_settings(command);
}

composition_options_t composition_arguments_t::options() const {
  if (options_.platform_file == standard_stream && options_.sink == standard_stream) {
    throw bad_input_t("--platform and --sink cannot both be read from standard input");
  }
  composition_options_t result = options_;
  result.settings.audio_sink_filter = audio_sink_filter_ ? 1 : 0;
  std::copy(latency_.begin(), latency_.end(), result.settings.edid_latency);
  return result;
}

void composition_arguments_t::add_inputs(CLI::App &command) {
  add_parsed_option(command, "--platform", options_.platform_file, parse_file_name,
                    "Platform configuration (TOML); the default one otherwise")
      ->type_name("FILE");
  add_parsed_option(command, "--sink", options_.sink, parse_file_name,
                    "EDID of the downstream sink: a file, raw or as text, or a connector; no sink otherwise")
      ->type_name("FILE");
  add_drm_directory(command, options_.drm_directory);
}

void composition_arguments_t::add_settings(CLI::App &command) {
  compose_cfg_t &settings = options_.settings;
  add_parsed_option(command, "--port", options_.ports, parse_ports,
                    "Input of the platform, counted from 0 (default 0), or several: 0..3")
      ->type_name("N");
  add_parsed_option(command, "--current-mode", settings.hdmi_current_mode, parse_video_mode,
                    "The mode that the platform puts out now, such as 1920x1080p60")
      ->type_name("MODE");
  add_parsed_option(command, "--audio-mask", settings.audio_mask, parse_mask,
                    "Audio formats that may be offered, decimal or 0x hexadecimal (default 0xFFFFFFFF)")
      ->type_name("MASK");
  command.add_flag("--audio-sink-filter", audio_sink_filter_, "Offer only audio formats that the sink supports too");
  add_parsed_option(command, "--3d", settings.hdmi_3d_mode, parse_3d_mode,
                    "Offer 3D never, as the sink does, or always (default sink)")
      ->type_name("off|sink|on");
  add_parsed_option(command, "--latency", latency_, parse_latency,
                    "Video, audio, interlaced video and interlaced audio latency in ms (default 0)")
      ->type_name("V,A,IV,IA");
  command.add_flag("--debug", options_.debug, "Trace every decision");
}

}  // namespace edid_cli

#include "commands/shared_options.h"

#include <algorithm>

#include "commands/option_values.h"
#include "edid_input/drm_connectors.h"
#include "io/bad_input.h"
#include "io/input.h"

namespace edid_cli {
namespace {

/// An option that also notes that it was given.
option_t noted(option_t option, std::set<std::string> &given) {
  const std::string name = setting_name(option);
  if (option.take) {
    option.take = [take = option.take, name, &given](const std::string &text) {
      take(text);
      given.insert(name);
    };
  } else {
    option.set = [set = option.set, name, &given] {
      set();
      given.insert(name);
    };
  }
  return option;
}

}  // namespace

option_t drm_directory_option(std::string &directory) {
  directory = default_drm_directory;
  option_t result = option("--drm-dir", "DIR", directory, parse_file_name,
                           std::string("The folder of the connectors (default ") + default_drm_directory + ")");
  result.environment = "EDID_COMPOSER_DRM_DIR";
  return result;
}

option_t edid_operand(const std::string &name, std::string &source) {
  return required(option(name, "", source, parse_file_name, "The EDID: a file, raw or as text, or a connector"));
}

std::vector<option_t> setting_options(composition_options_t &target) {
  compose_cfg_t &settings = target.settings;
  return {
      option("--port", "N", target.ports, parse_ports,
             "Input of the platform, counted from 0 (default 0), or several: 0..3"),
      option("--current-mode", "MODE", settings.hdmi_current_mode, parse_video_mode,
             "The mode that the platform puts out now, such as 1920x1080p60"),
      option("--audio-mask", "MASK", settings.audio_mask, parse_mask,
             "Audio formats that may be offered, decimal or 0x hexadecimal (default 0xFFFFFFFF)"),
      flag("--audio-sink-filter", settings.audio_sink_filter, "Offer only audio formats that the sink supports too"),
      option("--3d", "off|sink|on", settings.hdmi_3d_mode, parse_3d_mode,
             "Offer 3D never, as the sink does, or always (default sink)"),
      {"--latency", "V,A,IV,IA", "Video, audio, interlaced video and interlaced audio latency in ms (default 0)",
       [&settings](const std::string &text) {
         const latency_t latency = parse_latency(text);
         std::copy(latency.begin(), latency.end(), settings.edid_latency);
       }},
  };
}

std::string setting_name(const option_t &option) {
  return option.names.substr(std::string_view("--").size());
}

std::vector<option_t> composition_options(composition_options_t &target) {
  std::vector<option_t> options = {
      option("--platform", "FILE", target.platform_file, parse_file_name,
             "Platform configuration, TOML (default: the built-in one)"),
      option("--sink", "FILE", target.sink, parse_file_name,
             "EDID of the downstream sink: a file, raw or as text, or a connector (default: no sink)"),
      drm_directory_option(target.drm_directory),
  };
  for (const option_t &setting : setting_options(target)) {
    options.push_back(noted(setting, target.given));
  }
  options.push_back(flag("--debug", target.debug, "Trace every decision"));
  return options;
}

void check_composition_options(const composition_options_t &options) {
  if (options.platform_file == standard_stream && options.sink == standard_stream) {
    throw bad_input_t("--platform and --sink cannot both be read from standard input");
  }
}

}  // namespace edid_cli

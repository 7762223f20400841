#include "platform/configuration_readings.h"

#include "platform/platform_keys.h"

namespace edid_cli {
namespace {

bool is_audio_format(const kept_reading_t &reading) {
  return reading.key->kind == CONFIGURATION_AUDIO_FORMATS && reading.entry >= 0;
}

std::string audio_key_of(const kept_reading_t &reading) {
  return std::string(audio_table) + "." + audio_entry_prefix + static_cast<char>('a' + reading.entry);
}

}  // namespace

composition_t compose_without_sink(const compose_cfg_t &settings) {
  composition_options_t options;
  options.settings = settings;
  return compose(
      options, settings.port, {}, [](const compose_log_line_t &) {}, decisions_t::kept);
}

std::string name_of(const kept_reading_t &reading) {
  if (is_audio_format(reading)) {
    return audio_key_of(reading);
  }
  return reading.key->name + (reading.entry < 0 ? "" : "[" + std::to_string(reading.entry) + "]");
}

std::optional<configuration_node_t> node_of(const kept_reading_t &reading) {
  if (is_audio_format(reading)) {
    return configuration_node_t::find(platform_path(audio_key_of(reading)));
  }
  return configuration_node_t::find(reading.key->path + (reading.entry < 0 ? "" : "." + reading.node));
}

}  // namespace edid_cli

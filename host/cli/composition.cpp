#include "composition.h"

#include "bad_input.h"
#include "config_store.h"
#include "edid_file.h"
#include "input.h"

namespace edid_cli {

void load_platform(const std::optional<std::string> &file) {
  bool loaded = false;
  if (!file) {
    loaded = config_store_load_default();
  } else if (*file == standard_stream) {
    const std::string text = read_input(*file);
    loaded = config_store_load_text(text.data(), text.size(), input_name(*file).c_str());
  } else {
    loaded = config_store_load_file(file->c_str());
  }
  if (!loaded) {
    throw bad_input_t(config_store_error());
  }
}

std::vector<u8> read_sink(const composition_options_t &options) {
  return options.sink ? read_edid(*options.sink, options.drm_directory) : std::vector<u8>{};
}

std::optional<new_edid_t> compose(const composition_options_t &options, u32 port, const std::vector<u8> &sink) {
  compose_cfg_t settings = options.settings;
  settings.port = port;
  new_edid_t new_edid{};
  debug_enable(options.debug);
  if (!compose_edid(sink.empty() ? nullptr : sink.data(), static_cast<u32>(sink.size()), new_edid.data(),
                    static_cast<u32>(new_edid.size()), &settings)) {
    return std::nullopt;
  }
  return new_edid;
}

}  // namespace edid_cli

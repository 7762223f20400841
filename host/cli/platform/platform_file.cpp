#include "platform/platform_file.h"

#include "config_store.h"
#include "io/bad_input.h"
#include "io/input.h"

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

}  // namespace edid_cli

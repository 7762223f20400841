#include "edid_input/sink_folder.h"

#include <algorithm>
#include <filesystem>

#include "io/bad_input.h"
#include "io/input.h"

namespace edid_cli {

namespace fs = std::filesystem;

bool is_sink_folder(const std::optional<std::string> &source) {
  std::error_code ignored;
  return source && *source != standard_stream && fs::is_directory(*source, ignored);
}

std::vector<std::string> files_in(const std::string &folder) {
  std::vector<std::string> names;
  std::error_code error;
  for (fs::directory_iterator entry(folder, error), end; !error && entry != end; entry.increment(error)) {
    std::error_code ignored;
    const std::string name = entry->path().filename().string();
    if (!name.starts_with('.') && entry->is_regular_file(ignored)) {
      names.push_back(name);
    }
  }
  if (error) {
    throw bad_input_t(folder + ": " + error.message());
  }
  if (names.empty()) {
    throw bad_input_t(folder + ": holds no sinks");
  }
  std::sort(names.begin(), names.end());
  return names;
}

}  // namespace edid_cli

#include "edid_input/drm_connectors.h"

#include <algorithm>
#include <filesystem>

#include "io/bad_input.h"

namespace edid_cli {
namespace {

namespace fs = std::filesystem;

/// "card0-HDMI-A-1" without its card; empty when there is none.
std::string without_card(const std::string &name) {
  const std::size_t dash = name.find('-');
  return name.starts_with("card") && dash != std::string::npos ? name.substr(dash + 1) : "";
}

/// The connectors that can be read; @p error is why the folder cannot.
std::vector<connector_t> connectors_in(const std::string &drm_directory, std::error_code &error) {
  std::vector<connector_t> connectors;
  for (fs::directory_iterator entry(drm_directory, error), end; !error && entry != end; entry.increment(error)) {
    std::error_code ignored;
    const fs::path edid_file = entry->path() / "edid";
    if (fs::exists(edid_file, ignored)) {
      connectors.push_back({entry->path().filename().string(), edid_file.string()});
    }
  }
  std::sort(connectors.begin(), connectors.end(),
            [](const connector_t &left, const connector_t &right) { return left.name < right.name; });
  return connectors;
}

}  // namespace

std::vector<connector_t> list_connectors(const std::string &drm_directory) {
  std::error_code error;
  std::vector<connector_t> connectors = connectors_in(drm_directory, error);
  if (error) {
    throw bad_input_t(drm_directory + ": " + error.message());
  }
  return connectors;
}

std::optional<connector_t> find_connector(const std::string &drm_directory, const std::string &name) {
  std::error_code ignored;
  std::optional<connector_t> found;
  for (const connector_t &connector : connectors_in(drm_directory, ignored)) {
    if (connector.name == name) {
      return connector;
    }
    if (without_card(connector.name) != name) {
      continue;
    }
    if (found) {
      throw bad_input_t(name + ": may be " + found->name + " or " + connector.name);
    }
    found = connector;
  }
  return found;
}

}  // namespace edid_cli

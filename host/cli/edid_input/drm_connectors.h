// The display connectors of this machine, as the kernel shows them in a folder: one subfolder for each, with a file
// "edid" in it that is empty while nothing is connected.
#pragma once

#include <optional>
#include <string>
#include <vector>

namespace edid_cli {

inline constexpr const char *default_drm_directory = "/sys/class/drm";

struct connector_t {
  std::string name;  ///< Such as "card0-HDMI-A-1".
  std::string edid_file;
};

/// All connectors, sorted by name. Throws bad_input_t when the folder cannot be read.
std::vector<connector_t> list_connectors(const std::string &drm_directory);

/// The connector of a name, which may lack the card: "HDMI-A-1". Throws bad_input_t when several cards have one of that
/// name.
std::optional<connector_t> find_connector(const std::string &drm_directory, const std::string &name);

}  // namespace edid_cli

// A folder of sinks.
#pragma once

#include <optional>
#include <string>
#include <vector>

namespace edid_cli {

/// Whether the source of a sink is a folder of them.
bool is_sink_folder(const std::optional<std::string> &source);

/// The names of a folder's files, sorted; what is hidden or no file is passed over. Throws bad_input_t, also when there
/// are none.
std::vector<std::string> files_in(const std::string &folder);

}  // namespace edid_cli

// The file that the platform's configuration comes from.
#pragma once

#include <optional>
#include <string>

namespace edid_cli {

/// Loads the platform into the process's configuration store; the default one when there is no file. Throws
/// bad_input_t.
void load_platform(const std::optional<std::string> &file);

}  // namespace edid_cli

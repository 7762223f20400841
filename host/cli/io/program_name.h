// What the program calls itself.
#pragma once

namespace edid_cli {

inline constexpr const char *program_name = "edid-composer";

}  // namespace edid_cli

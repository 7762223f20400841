// What came of one of several compositions.
#pragma once

#include <string>
#include <vector>

namespace edid_cli {

struct batch_result_t {
  std::string failure;                   ///< Why there is no EDID; empty when there is one.
  std::string output;                    ///< What the library printed, with tracing on only.
  std::vector<std::string> diagnostics;  ///< What it reported as wrong: "WARNING: message".
  std::string passed_over{};             ///< Why the file was passed over: it is no EDID. Empty otherwise.
};

}  // namespace edid_cli

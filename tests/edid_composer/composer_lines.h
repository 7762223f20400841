// The diagnostic lines of module edid_composer, as output_of() returns them.
#pragma once

#include <string>

#include "support/output_capture.h"

namespace composer_lines {

inline std::string error(const std::string &function, const std::string &message) {
  return test_support::error_line("edid_composer", function, message);
}

inline std::string warning(const std::string &function, const std::string &message) {
  return test_support::warning_line("edid_composer", function, message);
}

inline std::string bug(const std::string &function, const std::string &message) {
  return test_support::bug_line("edid_composer", function, message);
}

inline std::string trace(const std::string &function, const std::string &message) {
  return test_support::trace_line(function, message);
}

}  // namespace composer_lines

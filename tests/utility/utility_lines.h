// Diagnostic lines of the module that these tests are about.
#pragma once

#include <string>

#include "support/output_capture.h"

namespace utility_tests {

inline std::string error(const std::string &function, const std::string &message) {
  return test_support::error_line("utility", function, message);
}

inline std::string warning(const std::string &function, const std::string &message) {
  return test_support::warning_line("utility", function, message);
}

inline std::string bug(const std::string &function, const std::string &message) {
  return test_support::bug_line("utility", function, message);
}

using test_support::output_of;
using test_support::trace_line;
using test_support::traced_output_of;

}  // namespace utility_tests

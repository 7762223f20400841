// The lines of the library's output that tell of something wrong.
#pragma once

#include <optional>
#include <string_view>

namespace edid_cli {

/// The parts of "module:line:function() KIND: message".
struct diagnostic_t {
  std::string_view function;
  std::string_view kind;  ///< "ERROR", "WARNING" or "BUG".
  std::string_view message;
};

/// The parts of a line; none when it is a trace or part of a report.
std::optional<diagnostic_t> parse_diagnostic(std::string_view line);

}  // namespace edid_cli

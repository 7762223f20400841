#include "diagnostics_walk.h"

#include <cstdio>
#include <ostream>
#include <utility>

#include "support/output_capture.h"
#include "support/patterns.h"

namespace diagnostics_walk {
namespace {

constexpr char wildcard = '*';

row_t prefixed(const char *level, const std::string &module, const std::string &function, const std::string &message,
               std::function<void()> provoke) {
  return {module + ":N:" + function + "() " + level + ": " + message, false, std::move(provoke)};
}

/// Tells whether the line stands in the output, as a line of its own.
bool stands_in(const std::string &output, const std::string &line) {
  const bool is_open = line.back() == wildcard;
  const std::string wanted = "\n" + (is_open ? line.substr(0, line.size() - 1) : line + "\n");
  return ("\n" + output).find(wanted) != std::string::npos;
}

}  // namespace

row_t error(const std::string &module, const std::string &function, const std::string &message,
            std::function<void()> provoke) {
  return prefixed("ERROR", module, function, message, std::move(provoke));
}

row_t warning(const std::string &module, const std::string &function, const std::string &message,
              std::function<void()> provoke) {
  return prefixed("WARNING", module, function, message, std::move(provoke));
}

row_t bug(const std::string &module, const std::string &function, const std::string &message,
          std::function<void()> provoke) {
  return prefixed("BUG", module, function, message, std::move(provoke));
}

row_t trace(const std::string &function, const std::string &message, std::function<void()> provoke) {
  return {message + " \t\t\t" + function + "():N", true, std::move(provoke)};
}

std::string name_of(const testing::TestParamInfo<row_t> &row) {
  char position[16];
  std::snprintf(position, sizeof position, "%03zu_", row.index);
  return position + test_support::first_match(row.param.line, "(\\w+)\\(\\)").at(1);
}

void PrintTo(const row_t &row, std::ostream *stream) {
  *stream << row.line;
}

TEST_P(DiagnosticsWalk, IsWritten) {
  const row_t &row = GetParam();
  if (row.traced) {
    EXPECT_FALSE(stands_in(test_support::output_of(row.provoke), row.line)) << row.line;
    const std::string output = test_support::traced_output_of(row.provoke);
    EXPECT_TRUE(stands_in(output, row.line)) << row.line << "\nnot in\n" << output;
  } else {
    const std::string output = test_support::output_of(row.provoke);
    EXPECT_TRUE(stands_in(output, row.line)) << row.line << "\nnot in\n" << output;
  }
}

}  // namespace diagnostics_walk

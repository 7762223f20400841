// What the library prints on standard output, for comparison line by line.
#pragma once

#include <functional>
#include <string>
#include <vector>

namespace test_support {

/// Runs @p action and returns what it wrote to C's stdout, with the line numbers of diagnostics and traces replaced by
/// "N" and pointers that are not "(nil)" by "PTR".
std::string output_of(const std::function<void()> &action);

/// As output_of(), cut into lines without their newlines.
std::vector<std::string> lines_of(const std::function<void()> &action);

/// As output_of(), with tracing on during @p action.
std::string traced_output_of(const std::function<void()> &action);

/// The lines as output_of() returns them, newline included.
std::string error_line(const std::string &module, const std::string &function, const std::string &message);
std::string warning_line(const std::string &module, const std::string &function, const std::string &message);
std::string bug_line(const std::string &module, const std::string &function, const std::string &message);
std::string trace_line(const std::string &function, const std::string &message);

/// Tells how often @p part stands in @p text.
int count_of(const std::string &text, const std::string &part);

}  // namespace test_support

// What the library prints on standard output, for comparison line by line.
#pragma once

#include <functional>
#include <string>
#include <vector>

namespace test_support {

/// Runs @p action and returns what it wrote to C's stdout, with the line numbers of diagnostics and traces replaced by
/// "N" and pointers that are not "(nil)" by "PTR". Standard output is put back also when @p action throws. Calls nest.
std::string output_of(const std::function<void()> &action);

/// As output_of(), cut into lines without their newlines. Text after the last newline is a line too.
std::vector<std::string> lines_of(const std::function<void()> &action);

/// As output_of(), with tracing on during @p action; the switch is then put back to what it was.
std::string traced_output_of(const std::function<void()> &action);

/// As lines_of(), with tracing on during @p action.
std::vector<std::string> traced_lines_of(const std::function<void()> &action);

/// As output_of(), byte for byte as written: nothing is masked.
std::string raw_output_of(const std::function<void()> &action);

/// What output_of() does to a text.
std::string masked(std::string text);

/// A text cut at its newlines.
std::vector<std::string> lines_in(const std::string &text);

/// The lines as output_of() returns them, newline included.
std::string error_line(const std::string &module, const std::string &function, const std::string &message);
std::string warning_line(const std::string &module, const std::string &function, const std::string &message);
std::string bug_line(const std::string &module, const std::string &function, const std::string &message);
std::string trace_line(const std::string &function, const std::string &message);

/// Tells how often @p part stands in @p text, overlaps not counted. An empty part stands nowhere.
int count_of(const std::string &text, const std::string &part);

}  // namespace test_support

#include "first_difference.h"

#include <algorithm>

#include "text_format.h"

namespace golden {
namespace {

/// The line that begins at @p start, its newline included; nothing after the end.
std::string line_at(const std::string &text, std::size_t start) {
  const std::size_t newline = text.find('\n', start);
  return text.substr(start, newline == std::string::npos ? newline : newline - start + 1);
}

std::string visible(const std::string &line) {
  if (line.empty()) return "the text has ended";
  std::string shown;
  for (const char character : line) {
    if (character == '\t') {
      shown += "\\t";
    } else if (character == '\n') {
      shown += "\\n";
    } else if (static_cast<unsigned char>(character) < 0x20) {
      shown += format("\\x%02X", static_cast<unsigned>(static_cast<unsigned char>(character)));
    } else {
      shown += character;
    }
  }
  return "\"" + shown + "\"";
}

}  // namespace

std::string first_difference(const std::string &expected, const std::string &actual) {
  if (expected == actual) return "";
  const auto differing = std::mismatch(expected.begin(), expected.end(), actual.begin(), actual.end()).first;
  const auto line = std::count(expected.begin(), differing, '\n') + 1;
  // Up to there the texts are the same, so the line begins at the same place in both.
  const auto position = static_cast<std::size_t>(differing - expected.begin());
  const std::size_t newline = position == 0 ? std::string::npos : expected.rfind('\n', position - 1);
  const std::size_t start = newline == std::string::npos ? 0 : newline + 1;
  return "line " + std::to_string(line) + "\n  expected: " + visible(line_at(expected, start)) +
         "\n  actual:   " + visible(line_at(actual, start));
}

}  // namespace golden

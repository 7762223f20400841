#include "edid_input/registry_value.h"

#include <algorithm>

#include "edid_input/hex_words.h"
#include "io/bad_input.h"
#include "text/lower_case.h"

namespace edid_cli {
namespace {

constexpr std::string_view first_lines[] = {"windows registry editor", "regedit4"};
constexpr std::string_view value_name = "\"edid\"=hex";

bool begins_value(const text_line_t &line) {
  return lower_case(trimmed(line.text)).starts_with(value_name);
}

/// Whether the value goes on in the next line.
bool goes_on(std::string_view text) {
  return trimmed(text).ends_with('\\');
}

std::string_view without_backslash(std::string_view text) {
  return text.substr(0, text.rfind('\\'));
}

}  // namespace

bool has_registry_value(std::span<const text_line_t> lines) {
  const auto first =
      std::find_if(lines.begin(), lines.end(), [](const auto &line) { return !trimmed(line.text).empty(); });
  const std::string text = first != lines.end() ? lower_case(trimmed(first->text)) : "";
  return std::any_of(std::begin(first_lines), std::end(first_lines),
                     [&text](std::string_view begin) { return text.starts_with(begin); });
}

std::vector<u8> read_registry_value(std::span<const text_line_t> lines, const std::string &name) {
  const auto value = std::find_if(lines.begin(), lines.end(), begins_value);
  if (value == lines.end()) {
    throw bad_input_t(name + ": no value \"EDID\"=hex:... in this part of the registry");
  }
  const auto another = std::find_if(std::next(value), lines.end(), begins_value);
  if (another != lines.end()) {
    throw bad_input_t(name + ":" + std::to_string(another->number) + ": a second EDID; the first is at line " +
                      std::to_string(value->number) + ". Leave one of them");
  }
  std::vector<u8> bytes;
  for (auto line = value; line != lines.end(); ++line) {
    std::string_view text = line->text;
    if (line == value) {
      text.remove_prefix(std::min(text.find(':') + 1, text.size()));
    }
    for (const std::string_view word : words_of(without_backslash(text))) {
      append_bytes(bytes, word, *line, name);
    }
    if (!goes_on(line->text)) {
      break;
    }
  }
  return bytes;
}

}  // namespace edid_cli

#include "text/text_lines.h"

#include <algorithm>

#include "io/bad_input.h"
#include "text/printable_text.h"

namespace edid_cli {
namespace {

constexpr std::string_view white_space = " \t\r\f\v";
constexpr std::string_view separators = " \t\r\f\v,";
constexpr std::size_t most_shown = 32;

}  // namespace

std::vector<text_line_t> lines_of(std::string_view text) {
  std::vector<text_line_t> lines;
  while (!text.empty()) {
    const std::string_view line = text.substr(0, text.find('\n'));
    lines.push_back({line, lines.size() + 1});
    text.remove_prefix(std::min(line.size() + 1, text.size()));
  }
  return lines;
}

std::vector<std::string_view> words_of(std::string_view text) {
  std::vector<std::string_view> words;
  for (;;) {
    text.remove_prefix(std::min(text.find_first_not_of(separators), text.size()));
    if (text.empty()) {
      return words;
    }
    words.push_back(text.substr(0, text.find_first_of(separators)));
    text.remove_prefix(words.back().size());
  }
}

std::string_view trimmed(std::string_view text) {
  text.remove_prefix(std::min(text.find_first_not_of(white_space), text.size()));
  return text.substr(0, text.find_last_not_of(white_space) + 1);
}

void refuse_at(const std::string &name, const text_line_t &line, std::string_view part, const std::string &problem) {
  const auto column = static_cast<std::size_t>(part.data() - line.text.data()) + 1;
  throw bad_input_t(name + ":" + std::to_string(line.number) + ":" + std::to_string(column) + ": \"" +
                    printable(part.substr(0, most_shown)) + "\" " + problem);
}

}  // namespace edid_cli

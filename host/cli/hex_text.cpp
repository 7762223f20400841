#include "hex_text.h"

#include <algorithm>

#include "bad_input.h"
#include "whole_number.h"

namespace edid_cli {
namespace {

constexpr std::string_view separators = " \t\r\f\v,";
constexpr std::string_view digits = "0123456789abcdefABCDEF";

[[noreturn]] void refuse(const std::string &name, std::size_t line, std::string_view group, const char *problem) {
  // Enough of it to be found again, and nothing that would upset a terminal.
  std::string shown(group.substr(0, 32));
  std::replace_if(
      shown.begin(), shown.end(), [](char character) { return character < 0x20 || character == 0x7F; }, '?');
  throw bad_input_t(name + ":" + std::to_string(line) + ": \"" + shown + "\" " + problem);
}

/// One group of digits without a separator in it.
void append_group(std::vector<u8> &bytes, std::string_view group, const std::string &name, std::size_t line) {
  const bool has_prefix = group.starts_with("0x") || group.starts_with("0X");
  const std::string_view number = has_prefix ? group.substr(2) : group;
  if (number.empty() || number.find_first_not_of(digits) != std::string_view::npos) {
    refuse(name, line, group, "is not hexadecimal");
  }
  if (number.size() % 2 != 0) {
    refuse(name, line, group, "has an odd number of hexadecimal digits");
  }
  for (std::size_t position = 0; position < number.size(); position += 2) {
    bytes.push_back(static_cast<u8>(*parse_whole_number(number.substr(position, 2), 16)));
  }
}

}  // namespace

std::vector<u8> parse_hex_text(std::string_view text, const std::string &name) {
  std::vector<u8> bytes;
  for (std::size_t line = 1; !text.empty(); ++line) {
    const std::size_t line_end = text.find('\n');
    std::string_view rest = text.substr(0, line_end);
    text.remove_prefix(line_end == std::string_view::npos ? text.size() : line_end + 1);

    rest = rest.substr(0, rest.find('#'));
    for (;;) {
      rest.remove_prefix(std::min(rest.find_first_not_of(separators), rest.size()));
      if (rest.empty()) {
        break;
      }
      const std::string_view group = rest.substr(0, rest.find_first_of(separators));
      append_group(bytes, group, name, line);
      rest.remove_prefix(group.size());
    }
  }
  return bytes;
}

}  // namespace edid_cli

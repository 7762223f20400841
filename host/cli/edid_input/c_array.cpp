#include "edid_input/c_array.h"

#include <algorithm>
#include <optional>

#include "io/bad_input.h"
#include "text/whole_number.h"

namespace edid_cli {
namespace {

constexpr std::string_view separators = " \t\r\f\v,;=";
constexpr std::string_view braces = "{}";

std::optional<u32> parse_c_number(std::string_view word) {
  if (word.starts_with("0x") || word.starts_with("0X")) {
    return parse_whole_number(word.substr(2), 16);
  }
  return parse_whole_number(word, word.size() > 1 && word.starts_with('0') ? 8 : 10);
}

/// Reads line by line.
class array_reader_t {
 public:
  explicit array_reader_t(const std::string &name) : name_(name) {}

  void read(const text_line_t &line) {
    std::string_view rest = line.text;
    while (!rest.empty()) {
      rest = is_in_comment_ ? after_comment(rest) : after_token(rest, line);
    }
  }

  std::vector<u8> finish() && {
    if (depth_ != 0) {
      throw bad_input_t(name_ + ": the array that begins at line " + std::to_string(begin_) + " has no closing brace");
    }
    return std::move(bytes_);
  }

 private:
  std::string_view after_comment(std::string_view rest) {
    const std::size_t end = rest.find("*/");
    is_in_comment_ = end == std::string_view::npos;
    return is_in_comment_ ? std::string_view() : rest.substr(end + 2);
  }

  std::string_view after_token(std::string_view rest, const text_line_t &line) {
    if (rest.starts_with("//") || rest.starts_with('#')) {
      return {};
    }
    if (rest.starts_with("/*")) {
      is_in_comment_ = true;
      return rest.substr(2);
    }
    if (braces.find(rest.front()) != std::string_view::npos) {
      take_brace(rest, line);
      return rest.substr(1);
    }
    if (separators.find(rest.front()) != std::string_view::npos) {
      return rest.substr(1);
    }
    const std::string_view word = rest.substr(0, std::min(rest.find_first_of(" \t\r\f\v,;={}/"), rest.size()));
    if (word.empty()) {
      return rest.substr(1);
    }
    if (depth_ != 0) {
      take_number(word, line);
    }
    return rest.substr(word.size());
  }

  void take_brace(std::string_view rest, const text_line_t &line) {
    if (rest.front() == '}') {
      depth_ -= depth_ != 0 ? 1 : 0;
      return;
    }
    if (depth_ == 0 && begin_ != 0) {
      refuse_at(name_, line, rest.substr(0, 1),
                "begins a second array; the first is at line " + std::to_string(begin_) + ". Leave one of them");
    }
    begin_ = begin_ == 0 ? line.number : begin_;
    ++depth_;
  }

  void take_number(std::string_view word, const text_line_t &line) {
    constexpr u32 largest = 0xFF;
    const auto number = parse_c_number(word);
    if (!number || *number > largest) {
      refuse_at(name_, line, word, "is not a number from 0 to 255");
    }
    bytes_.push_back(static_cast<u8>(*number));
  }

  const std::string &name_;
  std::vector<u8> bytes_;
  bool is_in_comment_ = false;
  std::size_t depth_ = 0;
  std::size_t begin_ = 0;  ///< The array's first line; 0: none yet.
};

}  // namespace

bool has_c_array(std::span<const text_line_t> lines) {
  return std::any_of(lines.begin(), lines.end(),
                     [](const auto &line) { return line.text.find('{') != std::string_view::npos; });
}

std::vector<u8> read_c_array(std::span<const text_line_t> lines, const std::string &name) {
  array_reader_t reader(name);
  for (const text_line_t &line : lines) {
    reader.read(line);
  }
  return std::move(reader).finish();
}

}  // namespace edid_cli

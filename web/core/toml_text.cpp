#include "toml_text.h"

#include <algorithm>
#include <string_view>

namespace edid_web {
namespace {

constexpr std::string_view blanks = " \t";

bool is_continuation(char character) {
  return (static_cast<unsigned char>(character) & 0xC0) == 0x80;
}

std::size_t end_of_string(const std::string &text, std::size_t begin) {
  const char quote = text[begin];
  const std::string_view view = text;
  const std::size_t width = view.substr(begin).starts_with(std::string(3, quote)) ? 3 : 1;
  const std::string closing(width, quote);
  std::size_t place = begin + width;
  while (place < text.size() && !view.substr(place).starts_with(closing)) {
    place += quote == '"' && text[place] == '\\' ? 2 : 1;
  }
  place = std::min(place + width, text.size());
  // Two more quotes may belong to a long string.
  while (width == 3 && place < text.size() && text[place] == quote) {
    ++place;
  }
  return place;
}

std::size_t end_of_brackets(const std::string &text, std::size_t begin) {
  int depth = 0;
  for (std::size_t place = begin; place < text.size();) {
    const char character = text[place];
    if (character == '"' || character == '\'') {
      place = end_of_string(text, place);
      continue;
    }
    if (character == '#') {
      place = end_of_line(text, place);
      continue;
    }
    depth += character == '[' || character == '{' ? 1 : character == ']' || character == '}' ? -1 : 0;
    ++place;
    if (depth == 0) {
      return place;
    }
  }
  return text.size();
}

}  // namespace

std::size_t offset_of(const std::string &text, const edid_cli::position_t &position) {
  constexpr std::string_view byte_order_mark = "\xEF\xBB\xBF";
  std::size_t place = text.starts_with(byte_order_mark) ? byte_order_mark.size() : 0;
  for (unsigned line = 1; line < position.line && place < text.size(); ++line) {
    place = std::min(end_of_line(text, place) + 1, text.size());
  }
  for (unsigned column = 1; column < position.column && place < text.size(); ++column) {
    do {
      ++place;
    } while (place < text.size() && is_continuation(text[place]));
  }
  return place;
}

std::size_t end_of_value(const std::string &text, std::size_t begin) {
  const char first = begin < text.size() ? text[begin] : '\0';
  if (first == '"' || first == '\'') {
    return end_of_string(text, begin);
  }
  if (first == '[' || first == '{') {
    return end_of_brackets(text, begin);
  }
  return std::min(text.find_first_of(" \t\r\n,]}#", begin), text.size());
}

std::size_t value_of_key(const std::string &text, std::size_t key) {
  std::size_t place = key;
  while (place < text.size() && text[place] != '=') {
    const char character = text[place];
    if (character == '\n' || character == ']') {
      return std::string::npos;
    }
    place = character == '"' || character == '\'' ? end_of_string(text, place) : place + 1;
  }
  return place < text.size() ? after_blanks(text, place + 1) : std::string::npos;
}

std::size_t begin_of_line(const std::string &text, std::size_t offset) {
  const std::size_t newline = offset == 0 ? std::string::npos : text.rfind('\n', offset - 1);
  return newline == std::string::npos ? 0 : newline + 1;
}

std::size_t end_of_line(const std::string &text, std::size_t offset) {
  return std::min(text.find('\n', offset), text.size());
}

std::size_t after_blanks(const std::string &text, std::size_t offset) {
  return std::min(text.find_first_not_of(blanks, offset), text.size());
}

bool begins_line(const std::string &text, std::size_t offset) {
  return after_blanks(text, begin_of_line(text, offset)) == offset;
}

bool ends_line(const std::string &text, std::size_t offset) {
  const std::size_t next = after_blanks(text, offset);
  return next == text.size() || text[next] == '#' || text[next] == '\n' || text[next] == '\r';
}

}  // namespace edid_web

#include "explain/json_writer.h"

#include <cstdio>

#include "explain/utf8_text.h"

namespace edid_cli {

void json_writer_t::begin_line() {
  if (!is_first_) {
    text_ += ',';
  }
  if (!closing_.empty()) {
    text_ += '\n';
    text_.append(2 * closing_.size(), ' ');
  }
  is_first_ = false;
}

void json_writer_t::begin_value() {
  if (!is_behind_key_) {
    begin_line();
  }
  is_behind_key_ = false;
}

json_writer_t &json_writer_t::open(char bracket) {
  begin_value();
  text_ += bracket;
  closing_ += bracket == '{' ? '}' : ']';
  is_first_ = true;
  return *this;
}

json_writer_t &json_writer_t::open_object() {
  return open('{');
}

json_writer_t &json_writer_t::open_list() {
  return open('[');
}

json_writer_t &json_writer_t::close() {
  const char bracket = closing_.back();
  closing_.pop_back();
  if (!is_first_) {
    text_ += '\n';
    text_.append(2 * closing_.size(), ' ');
  }
  text_ += bracket;
  is_first_ = false;
  return *this;
}

json_writer_t &json_writer_t::raw(const std::string &text) {
  begin_value();
  text_ += text;
  return *this;
}

json_writer_t &json_writer_t::key(std::string_view name) {
  begin_line();
  text_ += json_text(name) + ": ";
  is_behind_key_ = true;
  return *this;
}

json_writer_t &json_writer_t::value(std::string_view text) {
  return raw(json_text(text));
}

json_writer_t &json_writer_t::value(std::int64_t number) {
  return raw(std::to_string(number));
}

json_writer_t &json_writer_t::value(bool truth) {
  return raw(truth ? "true" : "false");
}

json_writer_t &json_writer_t::null() {
  return raw("null");
}

std::string json_text(std::string_view text) {
  std::string quoted = "\"";
  for (const char character : valid_utf8(text)) {
    const auto byte = static_cast<unsigned char>(character);
    if (character == '"' || character == '\\') {
      quoted += '\\';
      quoted += character;
    } else if (byte < 0x20 || byte == 0x7F) {
      char escaped[8];
      std::snprintf(escaped, sizeof escaped, "\\u%04X", static_cast<unsigned>(byte));
      quoted += escaped;
    } else {
      quoted += character;
    }
  }
  return quoted + "\"";
}

}  // namespace edid_cli

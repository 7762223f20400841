// Writing a JSON document (RFC 8259), indented.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

namespace edid_cli {

/// Members and elements are written in the order of the calls. The caller closes what it opens.
class json_writer_t {
 public:
  /// Each begins a value: behind a key in an object, as an element in a list.
  json_writer_t &open_object();
  json_writer_t &open_list();
  json_writer_t &close();

  json_writer_t &key(std::string_view name);
  json_writer_t &value(std::string_view text);
  json_writer_t &value(const char *text) { return value(std::string_view(text)); }
  json_writer_t &value(std::int64_t number);
  json_writer_t &value(bool truth);
  json_writer_t &null();

  /// A member in one call.
  template <typename value_t>
  json_writer_t &member(std::string_view name, const value_t &content) {
    return key(name).value(content);
  }

  /// The document so far, with a line feed at its end.
  std::string text() const { return text_ + "\n"; }

 private:
  void begin_value();
  void begin_line();
  json_writer_t &open(char bracket);
  json_writer_t &raw(const std::string &text);

  std::string text_;
  std::string closing_;  ///< The brackets that are still to be written, innermost last.
  bool is_first_ = true;
  bool is_behind_key_ = false;
};

/// A text in quotes.
std::string json_text(std::string_view text);

}  // namespace edid_cli

#include "text/utf8_text.h"

#include <utf8.h>

namespace edid_cli {
namespace {

constexpr const char *replacement_character = "\xEF\xBF\xBD";

/// What a byte is written as in HTML; null: as itself. Control characters are not allowed there in any form.
const char *html_form(char character) {
  switch (character) {
    case '&':
      return "&amp;";
    case '<':
      return "&lt;";
    case '>':
      return "&gt;";
    case '"':
      return "&quot;";
    case '\'':
      return "&#39;";
    default:
      return static_cast<unsigned char>(character) < 0x20 || character == 0x7F ? replacement_character : nullptr;
  }
}

}  // namespace

std::string valid_utf8(std::string_view text) {
  std::string valid;
  for (;;) {
    const auto *const invalid = utf8::find_invalid(text.begin(), text.end());
    valid.append(text.begin(), invalid);
    if (invalid == text.end()) {
      return valid;
    }
    valid += replacement_character;
    text.remove_prefix(static_cast<std::size_t>(invalid - text.begin()) + 1);
  }
}

std::string html_text(std::string_view text) {
  std::string html;
  for (const char character : valid_utf8(text)) {
    const char *const form = html_form(character);
    form != nullptr ? html.append(form) : html.append(1, character);
  }
  return html;
}

}  // namespace edid_cli

#include "explain/utf8_text.h"

#include <cstdint>

namespace edid_cli {
namespace {

constexpr const char *replacement_character = "\xEF\xBF\xBD";

struct utf8_length_t {
  unsigned mask;
  unsigned lead;
  std::size_t size;
  std::uint32_t smallest;  ///< A smaller character has a shorter form.
};

constexpr utf8_length_t lengths[] = {
    {0x80, 0x00, 1, 0}, {0xE0, 0xC0, 2, 0x80}, {0xF0, 0xE0, 3, 0x800}, {0xF8, 0xF0, 4, 0x10000}};

bool is_character(std::uint32_t code) {
  return code <= 0x10FFFF && (code < 0xD800 || code > 0xDFFF);
}

/// The bytes of the character that a text begins with; 0 when it begins with none.
std::size_t character_size(std::string_view text) {
  const auto lead = static_cast<unsigned char>(text.front());
  for (const utf8_length_t &length : lengths) {
    if ((lead & length.mask) != length.lead || text.size() < length.size) {
      continue;
    }
    std::uint32_t code = lead & ~length.mask & 0xFFU;
    for (std::size_t index = 1; index < length.size; ++index) {
      const auto next = static_cast<unsigned char>(text[index]);
      if ((next & 0xC0) != 0x80) {
        return 0;
      }
      code = code << 6 | (next & 0x3FU);
    }
    return code >= length.smallest && is_character(code) ? length.size : 0;
  }
  return 0;
}

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
  while (!text.empty()) {
    const std::size_t size = character_size(text);
    valid += size != 0 ? text.substr(0, size) : std::string_view(replacement_character);
    text.remove_prefix(size != 0 ? size : 1);
  }
  return valid;
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

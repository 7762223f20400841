#include "text/printable_text.h"

#include <utf8.h>
#include <algorithm>
#include <cstddef>

namespace edid_cli {
namespace {

bool is_control(char32_t character) {
  return character < 0x20 || (character >= 0x7F && character <= 0x9F);
}

using keeps_t = bool (*)(char32_t character);

std::string filtered(std::string_view text, keeps_t keeps) {
  std::string result;
  for (const char *place = text.data(), *const end = text.data() + text.size(); place != end;) {
    const char *const begin = place;
    // No character has more than four bytes.
    if (utf8::find_invalid(begin, begin + std::min<std::ptrdiff_t>(4, end - begin)) == begin) {
      result += '?';
      ++place;
      continue;
    }
    const char32_t character = utf8::unchecked::next(place);
    keeps(character) ? result.append(begin, place) : result.append(1, '?');
  }
  return result;
}

}  // namespace

std::string printable(std::string_view text) {
  return filtered(text, [](char32_t character) { return !is_control(character); });
}

std::string printable_lines(std::string_view text) {
  return filtered(
      text, [](char32_t character) { return character == U'\n' || character == U'\t' || !is_control(character); });
}

}  // namespace edid_cli

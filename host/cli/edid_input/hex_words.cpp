#include "edid_input/hex_words.h"

#include "text/whole_number.h"

namespace edid_cli {

bool is_hexadecimal(std::string_view word) {
  return !word.empty() && word.find_first_not_of("0123456789abcdefABCDEF") == std::string_view::npos;
}

void append_bytes(std::vector<u8> &bytes, std::string_view word, const text_line_t &line, const std::string &name) {
  const bool has_prefix = word.starts_with("0x") || word.starts_with("0X");
  const std::string_view digits = has_prefix ? word.substr(2) : word;
  if (!is_hexadecimal(digits)) {
    refuse_at(name, line, word, "is not hexadecimal");
  }
  if (digits.size() % 2 != 0) {
    refuse_at(name, line, word, "has an odd number of hexadecimal digits");
  }
  for (std::size_t position = 0; position < digits.size(); position += 2) {
    bytes.push_back(static_cast<u8>(*parse_whole_number(digits.substr(position, 2), 16)));
  }
}

}  // namespace edid_cli

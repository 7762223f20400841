#include "text_format.h"

#include <array>
#include <cstdarg>
#include <cstdio>
#include <stdexcept>

namespace golden {

std::string format(const char *pattern, ...) {
  std::array<char, 256> text{};
  va_list arguments;
  va_start(arguments, pattern);
  const int length = std::vsnprintf(text.data(), text.size(), pattern, arguments);
  va_end(arguments);
  if (length < 0 || static_cast<std::size_t>(length) >= text.size()) throw std::length_error(pattern);
  return text.data();
}

std::string listed(const std::vector<std::string> &texts, const std::string &otherwise) {
  std::string list;
  for (const std::string &text : texts)
    list += (list.empty() ? "" : ", ") + text;
  return list.empty() ? otherwise : list;
}

std::vector<std::string> set_bits(unsigned value, const std::vector<bit_name_t> &names) {
  std::vector<std::string> set;
  for (const bit_name_t &bit : names) {
    if ((value & bit.mask) != 0) set.emplace_back(bit.name);
  }
  return set;
}

}  // namespace golden

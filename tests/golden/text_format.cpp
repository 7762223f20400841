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

}  // namespace golden

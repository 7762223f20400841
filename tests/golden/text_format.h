// Texts made of numbers.
#pragma once

#include <string>

namespace golden {

/// As printf.
[[gnu::format(printf, 1, 2)]] std::string format(const char *pattern, ...);

}  // namespace golden

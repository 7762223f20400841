// Texts made of numbers and lists.
#pragma once

#include <string>
#include <vector>

#include "edid_composer.h"

namespace golden {

/// As printf.
[[gnu::format(printf, 1, 2)]] std::string format(const char *pattern, ...);

/// The texts, separated by ", "; @p otherwise when there are none.
std::string listed(const std::vector<std::string> &texts, const std::string &otherwise = "none");

/// One bit of a byte, and what it says when it is set.
struct bit_name_t {
  unsigned mask;
  const char *name;
};

/// The names of the set bits, in the order of the table.
std::vector<std::string> set_bits(unsigned value, const std::vector<bit_name_t> &names);

}  // namespace golden

#include "edid_composer/platform/decimal_number.h"

namespace edid_composer {

decimal_number_t read_decimal_number(const char *text) {
  const char *next = text;
  while (is_blank(*next))
    ++next;
  const bool negative = *next == '-';
  if (negative || *next == '+') ++next;
  if (!is_digit(*next)) return {0, text};
  // A number below this has room for a further digit.
  constexpr std::uint64_t full = UINT64_MAX / 10;
  const std::uint64_t largest = negative ? std::uint64_t{1} << 63 : INT64_MAX;
  std::uint64_t value = 0;
  for (; is_digit(*next); ++next)
    value = value < full ? value * 10 + static_cast<std::uint64_t>(*next - '0') : UINT64_MAX;
  if (value > largest) value = largest;
  return {static_cast<std::int64_t>(negative ? 0 - value : value), next};
}

}  // namespace edid_composer

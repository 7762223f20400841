#include "edid_composer/platform/decimal_number.h"

namespace edid_composer {

decimal_number_t read_decimal_number(const char *text) {
  const char *next = text;
  while (is_blank(*next))
    ++next;
  const bool negative = *next == '-';
  if (negative || *next == '+') ++next;
  if (!is_digit(*next)) return {0, text};
  // Counted downwards, as there is one negative number more.
  std::int64_t value = 0;
  bool in_range = true;
  for (; is_digit(*next); ++next) {
    in_range =
        in_range && !__builtin_mul_overflow(value, 10, &value) && !__builtin_sub_overflow(value, *next - '0', &value);
  }
  if (!in_range || (!negative && value == INT64_MIN)) return {negative ? INT64_MIN : INT64_MAX, next};
  return {negative ? value : -value, next};
}

}  // namespace edid_composer

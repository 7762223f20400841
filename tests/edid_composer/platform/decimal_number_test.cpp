// Decimal numbers in texts, compared with strtoll, whose grammar they have.
#include "edid_composer/platform/decimal_number.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <random>
#include <string>

namespace {

using edid_composer::low_32_bits;
using edid_composer::read_decimal_number;

void expect_as_strtoll(const std::string &text) {
  char *rest = nullptr;
  const long long expected = std::strtoll(text.c_str(), &rest, 10);
  const auto number = read_decimal_number(text.c_str());
  ASSERT_EQ(number.value, expected) << testing::PrintToString(text);
  ASSERT_EQ(number.rest, rest) << testing::PrintToString(text);
}

TEST(DecimalNumber, IsReadAsStrtollReadsIt) {
  for (const char *const text : {"",
                                 " ",
                                 "0",
                                 "-0",
                                 "7",
                                 "+7",
                                 "-7",
                                 "007",
                                 "42 rest",
                                 "42rest",
                                 " \t\n\v\f\r42",
                                 "- 7",
                                 "+-7",
                                 "--7",
                                 "+",
                                 "-",
                                 "x7",
                                 "0x10",
                                 "1e5",
                                 "\xA0"
                                 "7",
                                 "4294967295",
                                 "4294967296",
                                 "9223372036854775806",
                                 "9223372036854775807",
                                 "9223372036854775808",
                                 "9223372036854775817",
                                 "-9223372036854775807",
                                 "-9223372036854775808",
                                 "-9223372036854775809",
                                 "92233720368547758070",
                                 "-92233720368547758080",
                                 "99999999999999999999999999999999 rest",
                                 "-99999999999999999999999999999999",
                                 "000000000000000000000000000000000000007"}) {
    expect_as_strtoll(text);
  }
}

TEST(DecimalNumber, OfAnyTextIsReadAsStrtollReadsIt) {
  constexpr char likely[] = "  \t+-00123456789999x";
  std::mt19937 random(20121);
  const auto below = [&](unsigned limit) { return std::uniform_int_distribution<unsigned>(0, limit - 1)(random); };
  for (int i = 0; i < 200000; ++i) {
    std::string text;
    for (unsigned length = below(30); length > 0; --length)
      text += below(40) == 0 ? static_cast<char>(below(255) + 1) : likely[below(sizeof likely - 1)];
    ASSERT_NO_FATAL_FAILURE(expect_as_strtoll(text));
  }
}

TEST(DecimalNumber, IsKeptToItsLow32Bits) {
  EXPECT_EQ(low_32_bits(0), 0);
  EXPECT_EQ(low_32_bits(-1), -1);
  EXPECT_EQ(low_32_bits(INT32_MAX), INT32_MAX);
  EXPECT_EQ(low_32_bits(std::int64_t{INT32_MAX} + 1), INT32_MIN);
  EXPECT_EQ(low_32_bits((std::int64_t{1} << 32) + 16), 16);
  EXPECT_EQ(low_32_bits(INT64_MAX), -1);
  EXPECT_EQ(low_32_bits(INT64_MIN), 0);
}

}  // namespace

// The tests' own view on output: what it masks, and what it leaves as written.
#include "support/output_capture.h"

#include <gtest/gtest.h>
#include <unistd.h>

#include <cstdio>
#include <stdexcept>

namespace diagnostics_tests {
namespace {

using test_support::count_of;
using test_support::lines_in;
using test_support::masked;
using test_support::output_of;

TEST(OutputCapture, MasksLineNumbersOfDiagnosticsAndTraces) {
  EXPECT_EQ(masked("utility:12:f() ERROR: 12\nedid_composer:7:_g() WARNING: x\nlinked_list:1:ll() BUG: y\n"),
            "utility:N:f() ERROR: 12\nedid_composer:N:_g() WARNING: x\nlinked_list:N:ll() BUG: y\n");
  EXPECT_EQ(masked("text:12 \t\t\tf():345\n"), "text:12 \t\t\tf():N\n");
  EXPECT_EQ(masked("other:12:f() ERROR: x\n"), "other:12:f() ERROR: x\n");
}

TEST(OutputCapture, MasksAddressesButNoHexadecimalNumbers) {
  EXPECT_EQ(masked("ptr:0x7ffd12345678 ptr:(nil) 0x00746E69 0x12345678 0xffffffff 0x5\n"),
            "ptr:PTR ptr:(nil) 0x00746E69 0x12345678 0xffffffff 0x5\n");
}

TEST(OutputCapture, CatchesWhatIsFlushedInBetweenAndNests) {
  std::string inner;
  const std::string outer = output_of([&] {
    std::fputs("one ", stdout);
    std::fflush(stdout);
    inner = output_of([] { std::fputs("inner", stdout); });
    std::fputs("two", stdout);
  });
  EXPECT_EQ(outer, "one two");
  EXPECT_EQ(inner, "inner");
}

TEST(OutputCapture, PutsStandardOutputBackWhenTheActionThrows) {
  const std::string outer = output_of([] {
    EXPECT_THROW(output_of([] {
                   std::fputs("lost", stdout);
                   throw std::runtime_error("action");
                 }),
                 std::runtime_error);
    std::fputs("back", stdout);
  });
  EXPECT_EQ(outer, "back");
}

TEST(OutputCapture, CutsTextIntoLines) {
  EXPECT_EQ(lines_in("a\n\nb"), (std::vector<std::string>{"a", "", "b"}));
  EXPECT_EQ(lines_in("a\n\n"), (std::vector<std::string>{"a", ""}));
  EXPECT_EQ(lines_in(""), std::vector<std::string>{});
}

TEST(OutputCapture, CountsParts) {
  EXPECT_EQ(count_of("abcabcab", "abc"), 2);
  EXPECT_EQ(count_of("aaa", "aa"), 1);
  EXPECT_EQ(count_of("abc", "x"), 0);
}

}  // namespace
}  // namespace diagnostics_tests

// Limits that contradict each other end the process, after the reason was written out.
#include <gtest/gtest.h>

#include <csignal>

#include "edid_composer.h"
#include "support/configuration_tree.h"
#include "support/process_end.h"

namespace utility_tests {
namespace {

using test_support::end_of_process;
using test_support::process_end_t;

void expect_assertion(const process_end_t &end, const std::string &line) {
  EXPECT_EQ(end.signal, SIGABRT);
  EXPECT_EQ(end.standard_output, line);
  EXPECT_NE(end.standard_error.find("min <= default_val && default_val <= max"), std::string::npos)
      << end.standard_error;
}

TEST(GetterLimits, EndTheProcessWhenTheDefaultIsBelowTheMinimum) {
  expect_assertion(end_of_process([] { get_pc_int("week", 5, 10, -4, true); }),
                   "Invalid values for week: min:5 def:-4 max:10\n");
  expect_assertion(end_of_process([] { get_pc_uint("week", 5, 10, 4, true); }),
                   "Invalid values for week: min:5 def:4 max:10\n");
}

TEST(GetterLimits, EndTheProcessWhenTheDefaultIsAboveTheMaximum) {
  expect_assertion(end_of_process([] { get_pc_int("audio.pass_through", -5, 10, 11, true); }),
                   "Invalid values for audio.pass_through: min:-5 def:11 max:10\n");
  expect_assertion(end_of_process([] { get_pc_uint("audio.pass_through", 5, 10, 0xFFFFFFFF, true); }),
                   "Invalid values for audio.pass_through: min:5 def:4294967295 max:10\n");
}

TEST(GetterLimits, EndTheProcessWhenTheLimitsAreReversed) {
  expect_assertion(end_of_process([] { get_pc_int("key", 10, 5, 7, true); }),
                   "Invalid values for key: min:10 def:7 max:5\n");
  expect_assertion(end_of_process([] { get_pc_uint("key", 0xFFFFFFFF, 5, 7, true); }),
                   "Invalid values for key: min:4294967295 def:7 max:5\n");
}

TEST(GetterLimits, EndTheProcessWithoutWarningsToo) {
  expect_assertion(end_of_process([] { get_pc_int("key", 1, 2, 0, false); }),
                   "Invalid values for key: min:1 def:0 max:2\n");
}

TEST(GetterLimits, EndTheProcessBeforeTheConfigurationIsAsked) {
  const process_end_t end = end_of_process([] {
    test_support::configuration_tree_t tree;
    tree.set("key", 1);
    debug_enable(true);
    get_pc_int("key", 2, 1, 1, true);
  });
  expect_assertion(end, "Invalid values for key: min:2 def:1 max:1\n");
}

TEST(GetterLimits, KeepWhatWasPrintedBefore) {
  const process_end_t end = end_of_process([] {
    std::fputs("earlier, without a newline;", stdout);
    get_pc_uint("key", 2, 1, 1, true);
  });
  expect_assertion(end, "earlier, without a newline;Invalid values for key: min:2 def:1 max:1\n");
}

TEST(GetterLimits, MayAllBeEqual) {
  const process_end_t end = end_of_process([] {
    if (get_pc_int("key", -1, -1, -1, false) != -1) std::abort();
    if (get_pc_uint("key", 7, 7, 7, false) != 7) std::abort();
    std::fflush(stdout);
  });
  EXPECT_EQ(end.signal, 0);
  EXPECT_EQ(end.standard_output, "");
}

}  // namespace
}  // namespace utility_tests

// The four kinds of diagnostic line, byte for byte.
#define EDID_COMPOSER_MODULE "utility"
#include "diagnostics.h"

#include <gtest/gtest.h>

#include "support/output_capture.h"

namespace diagnostics_tests {
namespace {

using edid_composer::log_bug;
using edid_composer::log_error;
using edid_composer::log_trace;
using edid_composer::log_warning;
using test_support::raw_output_of;

REPORTS_AS(ll_size);

TEST(Diagnostics, PrefixErrorsWarningsAndBugsWithModuleLineAndFunction) {
  EXPECT_EQ(raw_output_of([] { log_error(site, 120, "a %d %s", 1, "b"); }), "utility:120:ll_size() ERROR: a 1 b\n");
  EXPECT_EQ(raw_output_of([] { log_warning(site, 120, "a %d %s", 1, "b"); }), "utility:120:ll_size() WARNING: a 1 b\n");
  EXPECT_EQ(raw_output_of([] { log_bug(site, 120, "a %d %s", 1, "b"); }), "utility:120:ll_size() BUG: a 1 b\n");
}

TEST(Diagnostics, PutTheSiteOfATraceAfterItsMessage) {
  EXPECT_EQ(raw_output_of([] { log_trace(site, 120, "a %d %s", 1, "b"); }), "a 1 b \t\t\tll_size():120\n");
}

TEST(Diagnostics, KeepAMessagesOwnNewlineAndAddTheLines) {
  EXPECT_EQ(raw_output_of([] { log_error(site, 120, "a\n"); }), "utility:120:ll_size() ERROR: a\n\n");
  EXPECT_EQ(raw_output_of([] { log_trace(site, 120, "a\n"); }), "a\n \t\t\tll_size():120\n");
}

TEST(Diagnostics, WriteMessagesOfAnyLength) {
  const std::string text(100000, 'x');
  EXPECT_EQ(raw_output_of([&] { log_bug(site, 120, "%s", text.c_str()); }),
            "utility:120:ll_size() BUG: " + text + "\n");
}

TEST(Diagnostics, NameTheDeclaredOperationAndTheLine) {
  const std::string line = std::to_string(__LINE__ + 1);
  EXPECT_EQ(raw_output_of([] { LOG_WARNING("text"); }), "utility:" + line + ":ll_size() WARNING: text\n");
}

TEST(Diagnostics, TraceOnlyWhileTracingIsOn) {
  const auto trace = [] { LOG_TRACE("text"); };
  EXPECT_EQ(raw_output_of(trace), "");
  debug_enable(true);
  EXPECT_EQ(test_support::masked(raw_output_of(trace)), test_support::trace_line("ll_size", "text"));
  debug_enable(false);
  EXPECT_EQ(raw_output_of(trace), "");
}

}  // namespace
}  // namespace diagnostics_tests

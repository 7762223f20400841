// The debug switch and the version text.
#include <gtest/gtest.h>

#include "support/configuration_tree.h"
#include "support/patterns.h"
#include "support/process_end.h"
#include "utility/utility_lines.h"

namespace utility_tests {
namespace {

/// Switches tracing off again whatever a test did.
class DebugSwitch : public testing::Test {
 protected:
  ~DebugSwitch() override { debug_enable(false); }
};

TEST_F(DebugSwitch, IsOffUntilTheFirstCall) {
  EXPECT_EQ(output_of([] {
              EXPECT_FALSE(debug_enabled());
              print_platform_node(0, "label");
              get_pc_int("absent", 0, 1, 0, true);
            }),
            warning("get_pc_int",
                    "Unable to find the platform path:platform.software.drivers.vorex.edid.absent Defaulting to:0"));
}

TEST_F(DebugSwitch, HoldsWhatItIsSetToAndPrintsNothing) {
  EXPECT_EQ(output_of([] {
              debug_enable(true);
              EXPECT_TRUE(debug_enabled());
              debug_enable(true);
              EXPECT_TRUE(debug_enabled());
              debug_enable(false);
              EXPECT_FALSE(debug_enabled());
            }),
            "");
}

TEST_F(DebugSwitch, SilencesTracesFromTheNextCallOn) {
  u32 ratio = 0;
  const std::string trace =
      trace_line("convert_geo_to_ratio", "Got a set of values that didn't match an aspect ratio. width=3 height=9");
  EXPECT_EQ(output_of([&] {
              debug_enable(true);
              convert_geo_to_ratio(3, 9, &ratio);
              debug_enable(false);
              convert_geo_to_ratio(3, 9, &ratio);
              debug_enable(true);
              convert_geo_to_ratio(3, 9, &ratio);
            }),
            trace + trace);
}

TEST_F(DebugSwitch, LeavesErrorsWarningsAndBugsAlone) {
  const auto report = [] {
    convert_geo_to_ratio(1, 1, nullptr);
    convert_vic_to_dtd(0, nullptr);
    print_est_man_type(1, nullptr, "title");
  };
  const std::string expected = error("convert_geo_to_ratio", "\"ratio\" parameter is NULL. ratio=(nil)") +
                               error("convert_vic_to_dtd", "\"timing\" parameter is NULL. timing:(nil)") +
                               bug("print_est_man_type", "string_func is:(nil)");
  EXPECT_EQ(output_of(report), expected);
  EXPECT_EQ(traced_output_of(report), expected);
}

TEST_F(DebugSwitch, WritesNothingToStandardError) {
  const test_support::process_end_t end = test_support::end_of_process([] {
    debug_enable(true);
    u32 ratio = 0;
    convert_geo_to_ratio(3, 9, &ratio);
    convert_geo_to_ratio(3, 9, nullptr);
    detailed_timing_t timing{};
    convert_vic_to_dtd(0, &timing);
    std::fflush(stdout);
  });
  EXPECT_EQ(end.standard_error, "");
  EXPECT_EQ(test_support::lines_in(end.standard_output).size(), 3u);
}

TEST(Version, NamesTheLibraryAndTheDateOfTheBuild) {
  const char *const version =
      "#@# libedid_composer\\.so Unofficial Build (Mon|Tue|Wed|Thu|Fri|Sat|Sun) "
      "(Jan|Feb|Mar|Apr|May|Jun|Jul|Aug|Sep|Oct|Nov|Dec) [ 123][0-9] [0-2][0-9]:[0-5][0-9]:[0-6][0-9] "
      "[A-Z0-9+-]+ [0-9]{4}";
  ASSERT_NE(gVersion, nullptr);
  EXPECT_TRUE(test_support::matches(gVersion, version)) << gVersion;
}

}  // namespace
}  // namespace utility_tests

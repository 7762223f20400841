// The refresh family of a sink.
#include "edid_composer/selection/native_rate.h"

#include <gtest/gtest.h>

#include <string>

#include "edid_composer/composer_lines.h"
#include "support/edid_builder.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using composer_lines::bug;
using composer_lines::trace;
using edid_composer::_determine_tv_native_refresh_rate;
using test_support::append;
using test_support::append_modes;
using test_support::traced_output_of;

constexpr const char *function = "_determine_tv_native_refresh_rate";

std::string found_dtd_60(int index, u32 rate) {
  return trace(function, "Found DTD number: index #" + std::to_string(index) + " had a " + std::to_string(rate) +
                             " Hz refresh rate. Using 60Hz as native rate.");
}

std::string found_dtd_50(int index, u32 rate) {
  return trace(function, "Found DTD number: index #" + std::to_string(index) + " had a " + std::to_string(rate) +
                             " Hz refresh rate. Using 50 as native rate.");
}

std::string found_standard(int index, u32 rate) {
  return trace(function, "Found a standard timing number: index #" + std::to_string(index) + " had a " +
                             std::to_string(rate) + "Hz refresh rate. Using 60 as native rate.");
}

std::string from_platform(int rate) {
  return trace(function,
               "Unable to find a video mode that indicates the native refresh rate of the television. Reading the "
               "platform config file for native refresh rate.") +
         trace(function, "Using " + std::to_string(rate) + "Hz as native rate.");
}

detailed_timing_t timing_with_rate(u32 rate) {
  detailed_timing_t timing = test_support::timing_of_vic(16);
  timing.h_active = timing.v_active = 900;
  timing.h_blanking = timing.v_blanking = 100;
  timing.pixel_clock = rate * 1000000;
  return timing;
}

class NativeRefreshRate : public testing::Test {
 protected:
  std::string determine(i32 expected) {
    return traced_output_of([&] { EXPECT_EQ(rate_of(sink_), expected); });
  }
  i32 rate_of(test_support::scoped_edid_t &sink) {
    return _determine_tv_native_refresh_rate({*sink.get(), *values_.get(), cfg_, nullptr}).hz;
  }

  test_support::scoped_edid_t sink_;
  test_support::scoped_values_t values_;
  compose_cfg_t cfg_ = test_support::plain_settings();
};

TEST_F(NativeRefreshRate, IsThatOfTheFirstDetailedTimingThatTells) {
  for (const u32 rate : {60U, 59U, 30U, 29U, 50U, 25U}) {
    test_support::scoped_edid_t sink;
    append(sink->dtd_list, timing_with_rate(rate));
    const bool sixty = rate != 50 && rate != 25;
    EXPECT_EQ(traced_output_of([&] { EXPECT_EQ(rate_of(sink), sixty ? 60 : 50); }),
              sixty ? found_dtd_60(0, rate) : found_dtd_50(0, rate));
  }
}

TEST_F(NativeRefreshRate, SkipsDetailedTimingsThatDoNotTellAndCountsThem) {
  for (const u32 rate : {24U, 100U, 49U, 51U, 58U, 61U, 26U, 31U, 28U, 25U, 60U})
    append(sink_->dtd_list, timing_with_rate(rate));
  EXPECT_EQ(determine(50), found_dtd_50(9, 25));
}

TEST_F(NativeRefreshRate, TruncatesTheRateOfADetailedTiming) {
  detailed_timing_t timing = timing_with_rate(60);
  timing.pixel_clock -= 1;
  append(sink_->dtd_list, timing);
  EXPECT_EQ(determine(60), found_dtd_60(0, 59));
}

TEST_F(NativeRefreshRate, OfADetailedTimingWithoutTotalsIsNone) {
  detailed_timing_t timing{};
  timing.valid = 1;
  timing.pixel_clock = 60000000;
  append(sink_->dtd_list, timing);
  timing.h_active = 60000000;
  append(sink_->dtd_list, timing);
  EXPECT_EQ(determine(60), from_platform(60));
}

TEST_F(NativeRefreshRate, FirstDetailedTimingWinsAgainstTheOthers) {
  append(sink_->dtd_list, test_support::timing_of_vic(33));  // 25 Hz
  append(sink_->dtd_list, test_support::timing_of_vic(16));
  append(sink_->dtd_list, test_support::timing_of_vic(4));
  append(sink_->std_timings, std_timing_t{1280, 2, 60});
  append_modes(sink_->video_list, {{16, 0}});
  EXPECT_EQ(determine(50), found_dtd_50(0, 25));
}

TEST_F(NativeRefreshRate, StandardTimingsTellSixtyOnly) {
  append(sink_->std_timings, std_timing_t{1280, 2, 75});
  append(sink_->std_timings, std_timing_t{1280, 2, 50});
  append(sink_->std_timings, std_timing_t{1280, 2, 59});
  append_modes(sink_->video_list, {{19, 0}});
  EXPECT_EQ(determine(60), found_standard(2, 59));
}

TEST_F(NativeRefreshRate, FiftyHertzStandardTimingLeavesItToThePlatform) {
  append(sink_->std_timings, std_timing_t{1280, 2, 50});
  EXPECT_EQ(determine(60), from_platform(60));
  values_->native_refresh_rate = 50;
  EXPECT_EQ(determine(50), from_platform(50));
}

TEST_F(NativeRefreshRate, ShortDescriptorsTellAsDetailedTimingsDo) {
  append_modes(sink_->video_list, {{32, 0}, {64, 0}, {65, 0}, {0, 0}, {19, 0}, {16, 0}});
  const std::string unknown = " Range:0-64";
  EXPECT_EQ(determine(50),
            test_support::warning_line("utility", "convert_vic_to_dtd",
                                       "Invalid vic requested for conversion to a DTD. Requested VIC:65" + unknown) +
                test_support::warning_line("utility", "convert_vic_to_dtd",
                                           "Invalid vic requested for conversion to a DTD. Requested VIC:0" + unknown) +
                found_dtd_50(4, 50));
}

TEST_F(NativeRefreshRate, OfEachVicFollowsItsTiming) {
  for (u32 vic = 1; vic <= 64; ++vic) {
    test_support::scoped_edid_t sink;
    append_modes(sink->video_list, {{vic, 0}});
    const detailed_timing_t timing = test_support::timing_of_vic(vic);
    const u32 rate = timing.pixel_clock / (timing.h_active + timing.h_blanking) / (timing.v_active + timing.v_blanking);
    const std::string expected = rate == 60 || rate == 59 || rate == 30 || rate == 29 ? found_dtd_60(0, rate)
                                 : rate == 50 || rate == 25                           ? found_dtd_50(0, rate)
                                                                                      : from_platform(60);
    EXPECT_EQ(traced_output_of([&] { rate_of(sink); }), expected) << vic;
  }
}

TEST_F(NativeRefreshRate, OfThePlatformIsForcedIntoAFamily) {
  for (const i32 rate : {55, 0, -50, 61}) {
    values_->native_refresh_rate = rate;
    EXPECT_EQ(determine(60), from_platform(rate) + bug(function,
                                                       "Expected to return only 50 or 60 here. Forcing value to 60. "
                                                       "Val:" +
                                                           std::to_string(rate)));
  }
}

}  // namespace

// Modes, standard timings, sizes and rates, and the VICs that stand for them.
#include <gtest/gtest.h>

#include "support/edid_builder.h"
#include "utility/utility_lines.h"

namespace utility_tests {
namespace {

using test_support::timing_of_vic;

/// The VIC that mode_to_vic() finds; 0, with the output untouched, when it finds none.
u32 vic_of_mode(const video_mode_t &mode) {
  constexpr u32 untouched = 12345;
  u32 vic = untouched;
  if (mode_to_vic(&mode, &vic) == 1) return vic;
  EXPECT_EQ(vic, untouched);
  return 0;
}

TEST(ModeToVic, FindsTheFirstVicOfAMode) {
  EXPECT_EQ(vic_of_mode({720, 576, 0, 50}), 17u);
  EXPECT_EQ(vic_of_mode({1280, 720, 0, 60}), 4u);
  EXPECT_EQ(vic_of_mode({1280, 720, 0, 50}), 19u);
  EXPECT_EQ(vic_of_mode({1920, 1080, 0, 60}), 16u);
  EXPECT_EQ(vic_of_mode({1920, 1080, 0, 24}), 32u);
  EXPECT_EQ(vic_of_mode({1920, 1080, 1, 60}), 5u);
  EXPECT_EQ(vic_of_mode({1920, 1080, 0, 120}), 63u);
  EXPECT_EQ(vic_of_mode({1920, 1080, 1, 120}), 46u);
}

TEST(ModeToVic, FindsTheEarlierOfTwo50HzRastersOf1080Lines) {
  EXPECT_EQ(vic_of_mode({1920, 1080, 1, 50}), 20u);
}

TEST(ModeToVic, FindsThe4x3TwinOfEveryVic) {
  for (u32 vic = 1; vic <= 64; ++vic) {
    const detailed_timing_t timing = timing_of_vic(vic);
    const video_mode_t mode{timing.h_active, timing.v_active * (timing.progressive ? 1 : 2),
                            timing.progressive ? 0u : 1u,
                            calculate_refresh_rate(timing.pixel_clock, timing.h_active, timing.h_blanking,
                                                   timing.v_active, timing.v_blanking)};
    const std::string name = short_video_timing_string(vic);
    const bool twin = vic > 1 && name.ends_with("16x9") &&
                      name.substr(0, name.size() - 4) + "4x3" == short_video_timing_string(vic - 1);
    EXPECT_EQ(vic_of_mode(mode), vic == 39 ? 20 : twin ? vic - 1 : vic) << name;
  }
}

TEST(ModeToVic, FindsPixelRepeatedLinesByHalfTheirWidth) {
  EXPECT_EQ(vic_of_mode({720, 480, 1, 60}), 6u);
  EXPECT_EQ(vic_of_mode({1440, 480, 1, 60}), 6u);
  EXPECT_EQ(vic_of_mode({720, 576, 1, 50}), 21u);
  EXPECT_EQ(vic_of_mode({720, 240, 0, 60}), 8u);
  EXPECT_EQ(vic_of_mode({2880, 480, 1, 60}), 10u);
  EXPECT_EQ(vic_of_mode({960, 1080, 0, 60}), 16u) << "half the width counts in every row";
}

TEST(ModeToVic, ComparesTheTruncatedRate) {
  EXPECT_EQ(vic_of_mode({720, 480, 0, 59}), 2u);
  EXPECT_EQ(vic_of_mode({720, 480, 0, 60}), 0u);
  EXPECT_EQ(vic_of_mode({640, 480, 0, 59}), 1u);
  EXPECT_EQ(vic_of_mode({1280, 720, 0, 59}), 0u);
}

TEST(ModeToVic, TakesOnlyOneForInterlaced) {
  EXPECT_EQ(vic_of_mode({1920, 1080, 2, 60}), 16u);
  EXPECT_EQ(vic_of_mode({1920, 1080, 0xFFFFFFFF, 60}), 16u);
}

TEST(ModeToVic, NeedsTheFrameHeight) {
  EXPECT_EQ(vic_of_mode({1920, 540, 1, 60}), 0u);
  EXPECT_EQ(vic_of_mode({1920, 1081, 1, 60}), 0u);
  EXPECT_EQ(vic_of_mode({1920, 2160, 0, 60}), 0u);
  EXPECT_EQ(vic_of_mode({0, 0, 0, 0}), 0u);
}

TEST(ModeToVic, TracesTheMode) {
  EXPECT_EQ(traced_output_of([] {
              vic_of_mode({1920, 1080, 1, 60});
            }),
            trace_line("mode_to_vic", "\tMode is 1920x1080i60. Attempting to find a match."));
  EXPECT_EQ(traced_output_of([] {
              vic_of_mode({0xFFFFFFFF, 3, 2, 0xFFFFFFFF});
            }),
            trace_line("mode_to_vic", "\tMode is -1x3p4294967295. Attempting to find a match."));
  EXPECT_EQ(output_of([] { vic_of_mode({1920, 1080, 1, 61}); }), "");
}

TEST(ModeToVic, ReportsANullModeBeforeANullVic) {
  const video_mode_t mode{1920, 1080, 0, 60};
  EXPECT_EQ(traced_output_of([&] {
              EXPECT_EQ(mode_to_vic(nullptr, nullptr), 0);
              EXPECT_EQ(mode_to_vic(&mode, nullptr), 0);
            }),
            error("mode_to_vic", "Parameter \"mode\" is NULL. mode:(nil)") +
                error("mode_to_vic", "Parameter \"vic\" is NULL. vic:(nil)"));
}

/// The VIC that convert_std_to_vic() finds, 0 when it finds none.
u32 vic_of_standard_timing(const std_timing_t &timing) {
  const edid_t edid{};
  u32 vic = 99;
  const u8 success = convert_std_to_vic(&edid, &timing, &vic);
  EXPECT_EQ(success, vic == 0 ? 0 : 1);
  return vic;
}

std::string unmatched_standard_timing(const std::string &text) {
  return trace_line("convert_std_to_vic", "Unable to match Standard Timing. " + text);
}

TEST(ConvertStdToVic, AsksForAHeightAboveTheWidthAndFindsNothing) {
  EXPECT_EQ(traced_output_of([] {
              EXPECT_EQ(vic_of_standard_timing({1280, 3, 60}), 0u);
            }),
            trace_line("mode_to_vic", "\tMode is 1280x2275p60. Attempting to find a match.") +
                trace_line("convert_std_to_vic", "Failed converting mode to vic. WxH=(1280,2275) Refresh:60") +
                unmatched_standard_timing("Hactive:1280 Aspect Ratio:16:9 Refresh Rate:60"));
  EXPECT_EQ(traced_output_of([] {
              EXPECT_EQ(vic_of_standard_timing({640, 1, 60}), 0u);
            }),
            trace_line("mode_to_vic", "\tMode is 640x853p60. Attempting to find a match.") +
                trace_line("convert_std_to_vic", "Failed converting mode to vic. WxH=(640,853) Refresh:60") +
                unmatched_standard_timing("Hactive:640 Aspect Ratio:4:3 Refresh Rate:60"));
}

TEST(ConvertStdToVic, FindsAVicWhereThatHeightHappensToFit) {
  EXPECT_EQ(traced_output_of([] {
              EXPECT_EQ(vic_of_standard_timing({360, 1, 59}), 2u);
            }),
            trace_line("mode_to_vic", "\tMode is 360x480p59. Attempting to find a match."));
}

TEST(ConvertStdToVic, RefusesRatiosThatNoVicHas) {
  EXPECT_EQ(traced_output_of([] {
              EXPECT_EQ(vic_of_standard_timing({1280, 2, 75}), 0u);
            }),
            trace_line("convert_std_to_vic",
                       "Aspect ratio of the standard timing is not a short video mode supported ratio. ratio:5:4") +
                unmatched_standard_timing("Hactive:1280 Aspect Ratio:5:4 Refresh Rate:75"));
  EXPECT_EQ(traced_output_of([] {
              EXPECT_EQ(vic_of_standard_timing({248, 0, 60}), 0u);
            }),
            trace_line("convert_std_to_vic",
                       "Aspect ratio of the standard timing is not a short video mode supported ratio. ratio:1:1") +
                unmatched_standard_timing("Hactive:248 Aspect Ratio:1:1 Refresh Rate:60"));
}

TEST(ConvertStdToVic, SkipsCodesThatAreNoRatio) {
  EXPECT_EQ(traced_output_of([] {
              EXPECT_EQ(vic_of_standard_timing({1280, 4, 60}), 0u);
            }),
            unmatched_standard_timing("Hactive:1280 Aspect Ratio:InvalidRatio Refresh Rate:60"));
}

TEST(ConvertStdToVic, WrapsTheHeightOfAHugeWidth) {
  EXPECT_EQ(traced_output_of([] {
              EXPECT_EQ(vic_of_standard_timing({0x40000003, 1, 60}), 0u);
            }),
            trace_line("mode_to_vic", "\tMode is 1073741827x4p60. Attempting to find a match.") +
                trace_line("convert_std_to_vic", "Failed converting mode to vic. WxH=(1073741827,4) Refresh:60") +
                unmatched_standard_timing("Hactive:1073741827 Aspect Ratio:4:3 Refresh Rate:60"));
}

TEST(ConvertStdToVic, IsSilentWhileTracingIsOff) {
  EXPECT_EQ(output_of([] { EXPECT_EQ(vic_of_standard_timing({1280, 3, 60}), 0u); }), "");
}

TEST(ConvertStdToVic, ChecksVicThenEdidThenTiming) {
  const edid_t edid{};
  u32 vic = 5;
  EXPECT_EQ(output_of([&] {
              EXPECT_EQ(convert_std_to_vic(nullptr, nullptr, nullptr), 0);
              EXPECT_EQ(convert_std_to_vic(nullptr, nullptr, &vic), 0);
              EXPECT_EQ(vic, 0u);
              vic = 5;
              EXPECT_EQ(convert_std_to_vic(&edid, nullptr, &vic), 0);
              EXPECT_EQ(vic, 0u);
            }),
            error("convert_std_to_vic", "\"vic\" parameter is NULL. vic:(nil)") +
                error("convert_std_to_vic", "\"edid\" parameter is NULL. edid:(nil)") +
                error("convert_std_to_vic", "\"timing\" parameter is NULL. timing:(nil)"));
}

/// The aspect code of a size; 99 when it has none.
u32 ratio_of(u32 width, u32 height) {
  u32 ratio = 99;
  const u8 success = convert_geo_to_ratio(width, height, &ratio);
  EXPECT_EQ(success, ratio == 99 ? 0 : 1);
  return ratio;
}

TEST(ConvertGeoToRatio, ClassifiesTheFourRatios) {
  EXPECT_EQ(traced_output_of([] {
              EXPECT_EQ(ratio_of(1024, 1024), 0u);
              EXPECT_EQ(ratio_of(640, 480), 1u);
              EXPECT_EQ(ratio_of(1280, 1024), 2u);
              EXPECT_EQ(ratio_of(1920, 1080), 3u);
            }),
            "");
}

TEST(ConvertGeoToRatio, ToleratesTruncationOnly) {
  EXPECT_EQ(ratio_of(1366, 768), 3u);
  EXPECT_EQ(ratio_of(1360, 768), 99u);
  EXPECT_EQ(ratio_of(531, 398), 1u);
  EXPECT_EQ(ratio_of(531, 399), 99u);
  EXPECT_EQ(ratio_of(708, 398), 3u);
}

TEST(ConvertGeoToRatio, NeverClassifiesThreeToTwoAndSixteenToTen) {
  EXPECT_EQ(ratio_of(720, 480), 99u);
  EXPECT_EQ(ratio_of(1280, 800), 99u);
  EXPECT_EQ(ratio_of(1920, 1200), 99u);
}

TEST(ConvertGeoToRatio, TakesTheFirstRatioThatHolds) {
  EXPECT_EQ(ratio_of(0, 0), 0u);
  EXPECT_EQ(ratio_of(1, 0), 1u);
  EXPECT_EQ(ratio_of(2, 1), 1u) << "4:3, 5:4 and 16:9 of 2 all truncate to 1";
  EXPECT_EQ(ratio_of(3, 1), 3u);
}

TEST(ConvertGeoToRatio, WrapsProductsTo32Bits) {
  EXPECT_EQ(ratio_of(0x80000000, 0x20000000), 1u);
  EXPECT_EQ(ratio_of(0xC0000000, 0), 2u);
}

TEST(ConvertGeoToRatio, TracesWhatItCannotClassify) {
  EXPECT_EQ(traced_output_of([] { ratio_of(720, 480); }),
            trace_line("convert_geo_to_ratio",
                       "Got a set of values that didn't match an aspect ratio. width=720 height=480"));
  EXPECT_EQ(output_of([] { ratio_of(720, 480); }), "");
}

TEST(ConvertGeoToRatio, ReportsANullOutput) {
  EXPECT_EQ(output_of([] { EXPECT_EQ(convert_geo_to_ratio(4, 3, nullptr), 0); }),
            error("convert_geo_to_ratio", "\"ratio\" parameter is NULL. ratio=(nil)"));
}

TEST(CalculateRefreshRate, TruncatesBothDivisions) {
  EXPECT_EQ(calculate_refresh_rate(74250000, 1920, 280, 540, 22), 60u);
  EXPECT_EQ(calculate_refresh_rate(148350000, 1920, 280, 1080, 45), 59u);
  EXPECT_EQ(calculate_refresh_rate(27000000, 720, 138, 480, 45), 59u);
  EXPECT_EQ(calculate_refresh_rate(1999, 600, 400, 1, 0), 1u);
  EXPECT_EQ(calculate_refresh_rate(0xFFFFFFFF, 1, 0, 1, 0), 0xFFFFFFFFu);
}

TEST(CalculateRefreshRate, IsZeroWhenATotalIsZero) {
  EXPECT_EQ(traced_output_of([] {
              EXPECT_EQ(calculate_refresh_rate(27000000, 0, 0, 480, 45), 0u);
              EXPECT_EQ(calculate_refresh_rate(27000000, 720, 138, 0, 0), 0u);
              EXPECT_EQ(calculate_refresh_rate(0, 0, 0, 0, 0), 0u);
              EXPECT_EQ(calculate_refresh_rate(27000000, 0xFFFFFFFF, 1, 480, 45), 0u);
              EXPECT_EQ(calculate_refresh_rate(100, 200, 0, 1, 0), 0u);
            }),
            "");
}

}  // namespace
}  // namespace utility_tests

// Finding the VIC of a detailed timing.
#include <gtest/gtest.h>

#include "support/edid_builder.h"
#include "utility/utility_lines.h"

namespace utility_tests {
namespace {

using test_support::timing_of_vic;

constexpr const char *function = "convert_dtd_to_vic";

/// A sink's record of which only the monitor size counts.
edid_t monitor(u8 h_size_cm, u8 v_size_cm) {
  edid_t edid{};
  edid.h_size_cm = h_size_cm;
  edid.v_size_cm = v_size_cm;
  return edid;
}

detailed_timing_t timing_with_image(u32 vic, u32 width, u32 height) {
  detailed_timing_t timing = timing_of_vic(vic);
  timing.h_image_size = width;
  timing.v_image_size = height;
  return timing;
}

/// The VIC that the conversion finds, 0 when it finds none.
u32 found(const detailed_timing_t &timing, const edid_t &edid = monitor(0, 0)) {
  u32 vic = 99;
  const u8 success = convert_dtd_to_vic(&edid, &timing, &vic);
  EXPECT_EQ(success, vic == 0 ? 0 : 1);
  return vic;
}

TEST(ConvertDtdToVic, FindsEveryVicFromItsOwnTimingExceptThe1250LineRaster) {
  EXPECT_EQ(traced_output_of([] {
              for (u32 vic = 1; vic <= 64; ++vic)
                EXPECT_EQ(found(timing_of_vic(vic)), vic == 39 ? 20 : vic);
            }),
            "");
}

TEST(ConvertDtdToVic, TellsTwinsApartByTheImageSize) {
  EXPECT_EQ(found(timing_with_image(3, 160, 120)), 2u);
  EXPECT_EQ(found(timing_with_image(2, 160, 90)), 3u);
  EXPECT_EQ(found(timing_with_image(3, 160, 120), monitor(160, 90)), 2u) << "the image size comes before the monitor's";
}

TEST(ConvertDtdToVic, FallsBackToTheMonitorSize) {
  for (const auto &[width, height] : {std::pair{0u, 0u}, {0u, 90u}, {160u, 0u}}) {
    EXPECT_EQ(found(timing_with_image(3, width, height), monitor(160, 90)), 3u);
    EXPECT_EQ(found(timing_with_image(3, width, height), monitor(40, 30)), 2u);
    EXPECT_EQ(found(timing_with_image(3, width, height), monitor(0, 0)), 0u);
    EXPECT_EQ(found(timing_with_image(3, width, height), monitor(160, 0)), 0u);
    EXPECT_EQ(found(timing_with_image(3, width, height), monitor(0, 90)), 0u);
  }
}

TEST(ConvertDtdToVic, NeedsTheAspectOfTheVic) {
  EXPECT_EQ(found(timing_with_image(16, 160, 120)), 0u);
  EXPECT_EQ(found(timing_with_image(16, 100, 100)), 0u);
  EXPECT_EQ(found(timing_with_image(16, 100, 80)), 0u);
}

TEST(ConvertDtdToVic, ComparesFiveFieldsAndTheAspect) {
  detailed_timing_t timing = timing_of_vic(16);
  timing.valid = 0;
  timing.h_sync_offset += 1;
  timing.h_sync_width += 1;
  timing.h_border = 1;
  timing.v_blanking += 1;
  timing.v_sync_offset += 1;
  timing.v_sync_width += 1;
  timing.v_border = 1;
  timing.stereo = 1;
  timing.h_sync_positive = 0;
  timing.v_sync_positive = 0;
  EXPECT_EQ(found(timing), 16u);
}

TEST(ConvertDtdToVic, NeedsEachOfTheFiveFields) {
  const auto changed = [](auto change) {
    detailed_timing_t timing = timing_of_vic(16);
    change(timing);
    return found(timing);
  };
  EXPECT_EQ(changed([](auto &timing) { timing.pixel_clock = 148350000; }), 0u) << "1080p at 59.94 Hz";
  EXPECT_EQ(changed([](auto &timing) { timing.progressive = 0; }), 0u);
  EXPECT_EQ(changed([](auto &timing) { timing.h_active += 1; }), 0u);
  EXPECT_EQ(changed([](auto &timing) { timing.h_blanking += 1; }), 0u);
  EXPECT_EQ(changed([](auto &timing) { timing.v_active += 1; }), 0u);
}

TEST(ConvertDtdToVic, ChecksVicThenEdidThenTiming) {
  const edid_t edid = monitor(0, 0);
  u32 vic = 5;
  EXPECT_EQ(output_of([&] {
              EXPECT_EQ(convert_dtd_to_vic(nullptr, nullptr, nullptr), 0);
              EXPECT_EQ(convert_dtd_to_vic(nullptr, nullptr, &vic), 0);
              EXPECT_EQ(vic, 0u);
              vic = 5;
              EXPECT_EQ(convert_dtd_to_vic(&edid, nullptr, &vic), 0);
              EXPECT_EQ(vic, 0u);
            }),
            error(function, "\"vic\" parameter is NULL. vic:(nil)") +
                error(function, "\"edid\" parameter is NULL. edid:(nil)") +
                error(function, "\"timing\" parameter is NULL. timing:(nil)"));
}

/// The closing traces for VIC 3's timing with another image size.
std::string unmatched_720x480p(const std::string &image_lines) {
  std::string lines;
  for (const char *line :
       {"Unable to match Detailed Timing Description.", "\tPixel Clock:     27000000", "\tRefresh Rate:    59",
        "\tH Active:        720", "\tH Blanking:      138", "\tV Active:        480", "\tV Blanking:      45",
        "\tH sync offset:   16", "\tH sync width:    62", "\tV sync offset:   9", "\tV sync width:    6"}) {
    lines += trace_line(function, line);
  }
  lines += image_lines;
  for (const char *line : {"\tH Border:        0", "\tV Border:        0", "\tScan:            Progressive",
                           "\tStereo:          No", "\tH sync:          Negative", "\tV sync:          Negative"}) {
    lines += trace_line(function, line);
  }
  return lines;
}

std::string image_lines(const std::string &h, const std::string &v) {
  return trace_line(function, "\tH image size:    " + h) + trace_line(function, "\tV image size:    " + v);
}

std::string no_ratio(const std::string &width, const std::string &height) {
  return trace_line("convert_geo_to_ratio",
                    "Got a set of values that didn't match an aspect ratio. width=" + width + " height=" + height);
}

TEST(ConvertDtdToVicTraces, TellOfAnImageSizeWithoutRatioForEachCandidate) {
  const std::string candidate =
      no_ratio("254", "127") +
      trace_line(function, "Unable to match timing size to an aspect ratio. H pixels:254 V pixels:127");
  EXPECT_EQ(traced_output_of([] { EXPECT_EQ(found(timing_with_image(3, 254, 127), monitor(160, 90)), 0u); }),
            candidate + candidate + unmatched_720x480p(image_lines("254 mm (10 in)", "127 mm (5 in)")));
}

TEST(ConvertDtdToVicTraces, TellOfMissingSizesForEachCandidate) {
  const std::string candidate =
      trace_line(function, "Timings image size is zeroed as is the EDID monitor size. Unable to match to a timing.");
  EXPECT_EQ(traced_output_of([] { EXPECT_EQ(found(timing_with_image(3, 25, 0), monitor(160, 0)), 0u); }),
            candidate + candidate + unmatched_720x480p(image_lines("25 mm (0 in)", "0 mm (0 in)")));
}

TEST(ConvertDtdToVicTraces, TellOfAMonitorSizeWithoutRatioForEachCandidate) {
  const std::string candidate =
      no_ratio("160", "100") +
      trace_line(function, "Unable to match image size to an aspect ratio. H pixels:160 V pixels:100");
  EXPECT_EQ(traced_output_of([] { EXPECT_EQ(found(timing_with_image(3, 0, 26), monitor(160, 100)), 0u); }),
            candidate + candidate + unmatched_720x480p(image_lines("0 mm (0 in)", "26 mm (1 in)")));
}

TEST(ConvertDtdToVicTraces, DescribeAnUnmatchedInterlacedStereoTiming) {
  detailed_timing_t timing{};
  timing.pixel_clock = 72000000;
  timing.h_active = 1920;
  timing.h_blanking = 384;
  timing.h_sync_offset = 33;
  timing.h_sync_width = 169;
  timing.h_border = 7;
  timing.v_active = 541;
  timing.v_blanking = 84;
  timing.v_sync_offset = 24;
  timing.v_sync_width = 4;
  timing.v_border = 8;
  timing.h_image_size = 1000;
  timing.v_image_size = 507;
  timing.stereo = 1;
  timing.h_sync_positive = 1;
  timing.v_sync_positive = 1;
  std::string expected;
  for (const char *line :
       {"Unable to match Detailed Timing Description.", "\tPixel Clock:     72000000", "\tRefresh Rate:    50",
        "\tH Active:        1920", "\tH Blanking:      384", "\tV Active:        541", "\tV Blanking:      84",
        "\tH sync offset:   33", "\tH sync width:    169", "\tV sync offset:   24", "\tV sync width:    4",
        "\tH image size:    1000 mm (39 in)", "\tV image size:    507 mm (19 in)", "\tH Border:        7",
        "\tV Border:        8", "\tScan:            Interlaced", "\tStereo:          Yes",
        "\tH sync:          Positive", "\tV sync:          Positive"}) {
    expected += trace_line(function, line);
  }
  EXPECT_EQ(traced_output_of([&] { EXPECT_EQ(found(timing), 0u); }), expected);
}

TEST(ConvertDtdToVicTraces, AreSilentWhileTracingIsOff) {
  EXPECT_EQ(output_of([] { EXPECT_EQ(found(timing_with_image(3, 254, 127)), 0u); }), "");
}

TEST(ConvertDtdToVicTraces, SurviveATimingWithoutTotals) {
  const detailed_timing_t timing{};
  const std::string output = traced_output_of([&] { EXPECT_EQ(found(timing), 0u); });
  EXPECT_EQ(test_support::count_of(output, trace_line(function, "\tRefresh Rate:    0")), 1);
}

}  // namespace
}  // namespace utility_tests

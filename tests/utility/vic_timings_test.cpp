// The table of VIC timings, against the standard's table and against the facts that the VICs' names tell.
#include "utility/vic_timings.h"

#include <gtest/gtest.h>

#include <cstring>
#include <set>

#include "support/edid_builder.h"
#include "support/patterns.h"
#include "utility/utility_lines.h"
#include "utility/vic_expectations.h"

namespace utility_tests {
namespace {

using edid_composer::g_vic_dtd;
using edid_composer::g_vic_dtd_size;
using test_support::timing_of_vic;

void expect_timing(u32 vic, const expected_timing_t &expected, u32 image_width) {
  SCOPED_TRACE("VIC " + std::to_string(vic));
  const detailed_timing_t timing = timing_of_vic(vic);
  EXPECT_EQ(timing.valid, 1);
  EXPECT_EQ(timing.pixel_clock, expected.pixel_clock);
  EXPECT_EQ(timing.h_active, expected.h_active);
  EXPECT_EQ(timing.h_blanking, expected.h_blanking);
  EXPECT_EQ(timing.h_sync_offset, expected.h_sync_offset);
  EXPECT_EQ(timing.h_sync_width, expected.h_sync_width);
  EXPECT_EQ(timing.h_border, 0);
  EXPECT_EQ(timing.v_active, expected.v_active);
  EXPECT_EQ(timing.v_blanking, expected.v_blanking);
  EXPECT_EQ(timing.v_sync_offset, expected.v_sync_offset);
  EXPECT_EQ(timing.v_sync_width, expected.v_sync_width);
  EXPECT_EQ(timing.v_border, 0);
  EXPECT_EQ(timing.h_image_size, image_width);
  EXPECT_EQ(timing.v_image_size, 398u);
  EXPECT_EQ(timing.progressive, expected.scan == 'p' ? 1 : 0);
  EXPECT_EQ(timing.stereo, 0);
  EXPECT_EQ(timing.h_sync_positive, expected.h_sync == '+' ? 1 : 0);
  EXPECT_EQ(timing.v_sync_positive, expected.v_sync == '+' ? 1 : 0);
}

TEST(VicTimings, AreThoseOfTheStandardForEveryVic) {
  std::set<u32> seen;
  for (const expected_timing_t &expected : expected_timings) {
    if (expected.vic_4x3 != 0) expect_timing(expected.vic_4x3, expected, 531);
    if (expected.vic_16x9 != 0) expect_timing(expected.vic_16x9, expected, 708);
    seen.insert({expected.vic_4x3, expected.vic_16x9});
  }
  seen.erase(0);
  EXPECT_EQ(seen.size(), 64u);
  EXPECT_EQ(*seen.begin(), 1u);
  EXPECT_EQ(*seen.rbegin(), 64u);
}

TEST(VicTimings, HoldTheirOwnVicExceptForThe1250LineRaster) {
  ASSERT_EQ(g_vic_dtd_size, 64u);
  for (u32 row = 0; row < g_vic_dtd_size; ++row)
    EXPECT_EQ(g_vic_dtd[row].vic, row == 38 ? 20 : row + 1);
}

/// What a VIC's name tells: "720(1440)x480i60Hz4x3" is a line of 1440 pixels.
struct named_facts_t {
  u32 pixels_per_line;
  u32 frame_lines;
  bool interlaced;
  u32 refresh;
  bool wide;
};

named_facts_t facts_in_name(const std::string &name) {
  const auto part = test_support::first_match(name, "^([0-9]+)(\\(([0-9]+)\\))?x([0-9]+)([pi])([0-9]+)Hz(4x3|16x9)$");
  if (part.empty()) throw std::invalid_argument(name);
  const auto number = [&](std::size_t group) { return static_cast<u32>(std::stoul(part[group])); };
  return {part[3].empty() ? number(1) : number(3), number(4), part[5] == "i", number(6), part[7] == "16x9"};
}

TEST(VicTimings, AgreeWithTheNamesOfTheirVics) {
  for (u32 vic = 1; vic <= 64; ++vic) {
    // The name of VIC 39 runs the lines of the picture and of the raster together.
    const std::string name = vic == 39 ? "1920x1080i50Hz16x9" : short_video_timing_string(vic);
    SCOPED_TRACE("VIC " + std::to_string(vic) + " " + name);
    const named_facts_t facts = facts_in_name(name);
    const detailed_timing_t timing = timing_of_vic(vic);
    EXPECT_EQ(timing.h_active, facts.pixels_per_line);
    EXPECT_EQ(timing.v_active * (facts.interlaced ? 2 : 1), facts.frame_lines);
    EXPECT_EQ(timing.progressive, facts.interlaced ? 0 : 1);
    u32 ratio = 99;
    EXPECT_EQ(convert_geo_to_ratio(timing.h_image_size, timing.v_image_size, &ratio), 1);
    EXPECT_EQ(ratio, facts.wide ? 3u : 1u);
  }
}

TEST(VicTimings, HaveTheRefreshRateOfTheirNames) {
  for (u32 vic = 1; vic <= 64; ++vic) {
    SCOPED_TRACE("VIC " + std::to_string(vic));
    const detailed_timing_t timing = timing_of_vic(vic);
    const u32 refresh = calculate_refresh_rate(timing.pixel_clock, timing.h_active, timing.h_blanking, timing.v_active,
                                               timing.v_blanking);
    const u32 named = facts_in_name(vic == 39 ? "1920x1080i50Hz16x9" : short_video_timing_string(vic)).refresh;
    // The 525-line progressive rasters run at 1000/1001 of the named rate, which truncates to one less.
    const bool slowed = timing.v_active + timing.v_blanking == 525;
    EXPECT_EQ(refresh, slowed ? named - 1 : named);
  }
}

TEST(VicTimings, HaveTheirSyncPulsesWithinTheBlanking) {
  for (u32 vic = 1; vic <= 64; ++vic) {
    SCOPED_TRACE("VIC " + std::to_string(vic));
    const detailed_timing_t timing = timing_of_vic(vic);
    EXPECT_LT(timing.h_sync_offset + timing.h_sync_width, timing.h_blanking);
    EXPECT_LT(timing.v_sync_offset + timing.v_sync_width, timing.v_blanking);
    EXPECT_EQ(timing.pixel_clock % 10000, 0u) << "a detailed timing descriptor counts in units of 10 kHz";
  }
}

TEST(ConvertVicToDtd, RefusesVicsOutsideTheTableWithItsOddBounds) {
  for (const u32 vic : {0u, 65u, 0xFFFFFFFFu}) {
    detailed_timing_t timing;
    std::memset(&timing, 0x5A, sizeof(timing));
    const detailed_timing_t before = timing;
    EXPECT_EQ(output_of([&] { EXPECT_EQ(convert_vic_to_dtd(vic, &timing), 0); }),
              warning("convert_vic_to_dtd", "Invalid vic requested for conversion to a DTD. Requested VIC:" +
                                                std::to_string(static_cast<i32>(vic)) + " Range:0-64"));
    EXPECT_EQ(std::memcmp(&timing, &before, sizeof(timing)), 0);
  }
}

TEST(ConvertVicToDtd, ReportsANullTimingBeforeABadVic) {
  EXPECT_EQ(output_of([] { EXPECT_EQ(convert_vic_to_dtd(0, nullptr), 0); }),
            error("convert_vic_to_dtd", "\"timing\" parameter is NULL. timing:(nil)"));
}

TEST(ConvertVicToDtd, FillsTheLastVicOfTheTableSilently) {
  detailed_timing_t timing{};
  EXPECT_EQ(traced_output_of([&] { EXPECT_EQ(convert_vic_to_dtd(64, &timing), 1); }), "");
  EXPECT_EQ(timing.h_active, 1920u);
  EXPECT_EQ(timing.v_active, 1080u);
  EXPECT_EQ(timing.progressive, 1);
  EXPECT_EQ(timing.pixel_clock, 297000000u);
}

TEST(ConvertVicToDtd, FillsThe1250LineRasterForItsOwnVic) {
  const detailed_timing_t timing = timing_of_vic(39);
  EXPECT_EQ(timing.pixel_clock, 72000000u);
  EXPECT_EQ(timing.v_active + timing.v_blanking, 625u);
}

}  // namespace
}  // namespace utility_tests

// The timings of the VICs above 64, against what another program prints of them.
#include "edid_composer/hdmi2/codec/extended_vics.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <map>
#include <memory>
#include <string>

namespace hdmi2_test {
namespace {

using edid_composer::extended_timing_t;
using edid_composer::timing_of_extended_vic;

/// A VIC in vic_timings.txt.
struct listed_t {
  u32 width, lines, aspect_width, aspect_height, h_front, h_sync, h_back, v_front, v_sync, v_back;
  double hertz, line_kilohertz, megahertz;
};

/// What edid-decode printed for each of the VICs; independent.vics_are_as_listed has it print them anew.
std::map<u32, listed_t> listed_timings() {
  std::map<u32, listed_t> timings;
  const std::unique_ptr<std::FILE, int (*)(std::FILE *)> file(std::fopen(TESTS_DIR "/independent/vic_timings.txt", "r"),
                                                              std::fclose);
  if (file == nullptr) return timings;
  u32 vic = 0;
  listed_t row{};
  while (std::fscanf(file.get(),
                     " VIC %u: %ux%u %lf Hz %u:%u %lf kHz %lf MHz Hfront %u Hsync %u Hback %u Hpol P Vfront %u Vsync "
                     "%u Vback %u Vpol P",
                     &vic, &row.width, &row.lines, &row.hertz, &row.aspect_width, &row.aspect_height,
                     &row.line_kilohertz, &row.megahertz, &row.h_front, &row.h_sync, &row.h_back, &row.v_front,
                     &row.v_sync, &row.v_back) == 14) {
    timings[vic] = row;
  }
  EXPECT_TRUE(std::feof(file.get()) != 0) << "after VIC " << vic;
  return timings;
}

void expect_raster(const edid_composer::raster_t &raster, u32 active, u32 front, u32 sync, u32 back) {
  EXPECT_EQ(raster.active, active);
  EXPECT_EQ(raster.blanking, front + sync + back);
  EXPECT_EQ(raster.sync_offset, front);
  EXPECT_EQ(raster.sync_width, sync);
}

}  // namespace

TEST(ExtendedVics, HaveTheTimingsOfTheStandard) {
  const std::map<u32, listed_t> listed = listed_timings();
  EXPECT_EQ(listed.size(), 90u);
  for (const auto &[vic, row] : listed) {
    SCOPED_TRACE(vic);
    const extended_timing_t *const timing = timing_of_extended_vic(vic);
    ASSERT_NE(timing, nullptr);
    EXPECT_EQ(timing->vic, vic);
    EXPECT_NEAR(timing->pixel_clock_khz, row.megahertz * 1000, 1e-3);
    expect_raster(timing->horizontal, row.width, row.h_front, row.h_sync, row.h_back);
    expect_raster(timing->vertical, row.lines, row.v_front, row.v_sync, row.v_back);
    EXPECT_EQ(timing->aspect.width, row.aspect_width);
    EXPECT_EQ(timing->aspect.height, row.aspect_height);
    EXPECT_NEAR(edid_composer::line_rate(*timing), row.line_kilohertz * 1000, 1e-3);
    EXPECT_NEAR(edid_composer::frame_rate(*timing), row.hertz, 1e-6);
  }
}

TEST(ExtendedVics, AreNamedAfterTheirTimings) {
  for (const auto &[vic, row] : listed_timings()) {
    EXPECT_EQ(extended_vic_string(vic), std::to_string(row.width) + "x" + std::to_string(row.lines) + "p" +
                                            std::to_string(static_cast<u32>(row.hertz)) + "Hz" +
                                            std::to_string(row.aspect_width) + "x" + std::to_string(row.aspect_height));
  }
  EXPECT_STREQ(extended_vic_string(97), "3840x2160p60Hz16x9");
  EXPECT_STREQ(extended_vic_string(218), "4096x2160p100Hz256x135");
}

TEST(ExtendedVics, AreNoOthers) {
  for (const u32 vic : {0u, 1u, 64u, 128u, 129u, 192u, 220u, 255u, 256u, 321u, 0xFFFFFFFFu}) {
    EXPECT_EQ(timing_of_extended_vic(vic), nullptr) << vic;
    EXPECT_STREQ(extended_vic_string(vic), "Unknown Value") << vic;
  }
}

TEST(ExtendedVics, FitADetailedTimingWhereItsFieldsHoldThem) {
  for (const auto &[vic, row] : listed_timings()) {
    const bool fits = row.width <= 4095 && row.h_front <= 1023 && row.megahertz <= 655.35;
    EXPECT_EQ(edid_composer::fits_detailed_timing(*timing_of_extended_vic(vic)), fits) << vic;
  }
  EXPECT_TRUE(edid_composer::fits_detailed_timing(*timing_of_extended_vic(97)));
  EXPECT_FALSE(edid_composer::fits_detailed_timing(*timing_of_extended_vic(96)));
}

TEST(ExtendedVics, BecomeDetailedTimings) {
  const detailed_timing_t timing = edid_composer::detailed_timing_of(*timing_of_extended_vic(97));
  EXPECT_EQ(timing.valid, 1);
  EXPECT_EQ(timing.pixel_clock, 594000000u);
  EXPECT_EQ(timing.h_active, 3840u);
  EXPECT_EQ(timing.h_blanking, 560u);
  EXPECT_EQ(timing.h_sync_offset, 176u);
  EXPECT_EQ(timing.h_sync_width, 88u);
  EXPECT_EQ(timing.v_active, 2160u);
  EXPECT_EQ(timing.v_blanking, 90u);
  EXPECT_EQ(timing.v_sync_offset, 8u);
  EXPECT_EQ(timing.v_sync_width, 10u);
  EXPECT_EQ(timing.h_image_size, 708u);
  EXPECT_EQ(timing.v_image_size, 398u);
  EXPECT_EQ(timing.progressive, 1);
  EXPECT_EQ(timing.h_sync_positive, 1);
  EXPECT_EQ(timing.v_sync_positive, 1);
  EXPECT_EQ(timing.h_border + timing.v_border + timing.stereo, 0);
}

}  // namespace hdmi2_test

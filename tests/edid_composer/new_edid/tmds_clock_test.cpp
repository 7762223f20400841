// The maximum TMDS clock of a new EDID, and the pixel clock that it follows from.
#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <vector>

#include "edid_composer/composer_lines.h"
#include "edid_composer/new_edid/population_fixture.h"

namespace {

using composer_lines::bug;
using edid_composer::_maximum_pixel_clock;
using test_support::output_of;

using modes_t = std::vector<test_support::mode_pair_t>;

class scoped_modes_t : public test_support::scoped_list_t<short_video_desc_t> {
 public:
  explicit scoped_modes_t(const modes_t &modes) { test_support::append_modes(**this, modes); }
};

u32 maximum_of(const modes_t &modes) {
  scoped_modes_t list(modes);
  return _maximum_pixel_clock(list.get());
}

class TmdsClock : public composer_fixtures::Population {
 protected:
  struct setting_t {
    i32 override_mhz = 0;
    bool deep_colour = false;
    bool modes_4k = false;
  };

  u32 clock_of(const modes_t &modes, const setting_t &setting) {
    values_->tmds_override = setting.override_mhz;
    scoped_modes_t list(modes);
    u32 clock = 0;
    EXPECT_EQ(output_of([&] {
                clock = edid_composer::declare_tmds_clock(inputs(), *list.get(), setting.modes_4k,
                                                          {false, setting.deep_colour, false})
                            .held_mhz();
              }),
              "");
    return clock;
  }
  static modes_t one(u32 vic, u32 stereo = 0) { return {{vic, stereo}, {1, 0}, {1, 0}, {1, 0}}; }
};

TEST_F(TmdsClock, IsNotDeclaredForOrdinaryModes) {
  EXPECT_EQ(clock_of(one(16), {}), 0U);
  EXPECT_EQ(clock_of(one(1), {}), 0U);
}

TEST_F(TmdsClock, IsDeclaredFrom165MegahertzOn) {
  EXPECT_EQ(clock_of(one(63), {}), 300U);     // 297 MHz
  EXPECT_EQ(clock_of(one(16, 1), {}), 300U);  // 148.5 MHz, twice
  EXPECT_EQ(clock_of(one(4, 1), {}), 0U);     // 74.25 MHz, twice
  EXPECT_EQ(clock_of(one(4, 0x80), {}), 300U);
}

TEST_F(TmdsClock, IsDeclaredForDeepColour) {
  EXPECT_EQ(clock_of(one(16), {0, true, false}), 225U);  // 222.75 MHz
  EXPECT_EQ(clock_of(one(1), {0, true, false}), 40U);    // 37.77 MHz
  EXPECT_EQ(clock_of(one(4), {0, true, false}), 115U);   // 111.375 MHz
}

TEST_F(TmdsClock, Of30BitDeepColourIsThatOf36) {
  values_->dc_30bit = 1;
  output();
  EXPECT_EQ(new_.max_tmds_clock, 225U);
}

TEST_F(TmdsClock, IsAtLeast297MegahertzFor4kModes) {
  EXPECT_EQ(clock_of(one(1), {0, false, true}), 300U);
  EXPECT_EQ(clock_of(one(16), {0, false, true}), 300U);
  EXPECT_EQ(clock_of(one(16), {0, true, true}), 300U);
  EXPECT_EQ(clock_of(one(63), {0, true, true}), 450U);  // 445.5 MHz
}

TEST_F(TmdsClock, AddsFiveToWhatIsAMultipleOfFiveAlready) {
  // 27 MHz x 1.5 is 40.5, cut to 40.
  EXPECT_EQ(clock_of(one(2), {0, true, false}), 45U);
  // 108 MHz x 8 x 1.5 is 1296, more than can be declared.
  EXPECT_EQ(clock_of(one(52, 0x81), {0, true, false}), 1275U);
  // 25.18 MHz is 25 whole ones.
  EXPECT_EQ(clock_of(one(1), {1, false, false}), 30U);
}

TEST_F(TmdsClock, IsCapped) {
  EXPECT_EQ(clock_of(one(63, 0x81), {}), 1275U);                 // 2376 MHz
  EXPECT_EQ(clock_of(one(63, 0x81), {0, true, false}), 1275U);   // 3564 MHz
  EXPECT_EQ(clock_of(one(63, 0x80), {0, false, false}), 1190U);  // 1188 MHz
  EXPECT_EQ(clock_of(one(1), {1300, false, false}), 1275U);
  EXPECT_EQ(clock_of(one(1), {0x7FFFFFFF, false, false}), 1275U);
}

TEST_F(TmdsClock, IsTheOverrideFrom25On) {
  EXPECT_EQ(clock_of(one(63, 1), {25, true, true}), 25U);
  EXPECT_EQ(clock_of(one(1), {340, false, false}), 340U);
  EXPECT_EQ(clock_of(one(1), {1275, false, false}), 1275U);
  EXPECT_EQ(clock_of(one(1), {26, false, false}), 26U);
}

TEST_F(TmdsClock, OfASmallerOverrideIsComputedAndDeclared) {
  for (const i32 override_mhz : {1, 24, -1}) {
    EXPECT_EQ(clock_of(one(16), {override_mhz, false, false}), 150U);  // 148.5 MHz
    EXPECT_EQ(clock_of(one(4), {override_mhz, false, false}), 75U);    // 74.25 MHz
  }
}

TEST_F(TmdsClock, FollowsItsRuleForEachVicAndEach3dMask) {
  for (u32 vic = 1; vic <= 64; ++vic) {
    detailed_timing_t timing{};
    ASSERT_EQ(convert_vic_to_dtd(vic, &timing), 1);
    for (u32 stereo = 0; stereo <= 0xFF; ++stereo) {
      scoped_modes_t list({{vic, stereo}});
      std::uint64_t expected = timing.pixel_clock;
      if ((stereo & 0x01) != 0 || (stereo & 0x08) != 0 || (stereo & 0x10) != 0 || (stereo & 0x20) != 0 ||
          (stereo & 0x40) != 0) {
        expected *= 2;
      }
      if ((stereo & 0x80) != 0) expected *= 4;
      ASSERT_EQ(_maximum_pixel_clock(list.get()), expected) << vic << " " << stereo;
    }
  }
}

TEST_F(TmdsClock, FollowsTheModeWithTheLargestPixelClock) {
  EXPECT_EQ(maximum_of({{1, 0}, {4, 0x1}, {16, 0}, {63, 0x6}, {2, 0xFF}}), 297000000U);
  EXPECT_EQ(maximum_of({{2, 0xFF}, {1, 0}}), 216000000U);
}

TEST_F(TmdsClock, PixelClockOfNoModesIsZeroAndABug) {
  EXPECT_EQ(output_of([&] { EXPECT_EQ(maximum_of({}), 0U); }),
            bug("_maximum_pixel_clock", "\tReceived a list that contains no entries. List:PTR"));
}

TEST_F(TmdsClock, PixelClockSkipsUnknownVics) {
  EXPECT_EQ(output_of([&] {
              EXPECT_EQ(maximum_of({{65, 0x80}, {4, 0}}), 74250000U);
            }),
            test_support::warning_line("utility", "convert_vic_to_dtd",
                                       "Invalid vic requested for conversion to a DTD. Requested VIC:65 Range:0-64") +
                bug("_maximum_pixel_clock", "\tFailed converting VIC:65 to a DTD."));
}

TEST_F(TmdsClock, OverrideAsksForNoPixelClock) {
  EXPECT_EQ(clock_of({}, {25, false, false}), 25U);
}

}  // namespace

// What HDMI 2 changes in the HDMI block: depths, the maximum TMDS clock, 3D structures; and in the base block.
#include "edid_composer/hdmi2/layer_composition.h"

namespace hdmi2_test {
namespace {

class ChangedBlocks : public testing::Test {
 protected:
  u32 clock() { return compose(situation_).tmds_clock(); }
  /// The support byte of the HDMI block: 36 bit 0x20, 30 bit 0x10, Y444 0x08.
  u8 support() { return compose(situation_).block(vendor_specific, {0x03, 0x0C, 0x00})->at(5); }
  void offer(const std::vector<i32> &vics) {
    situation_.name(vics);
    situation_.add(vics);
  }

  layer_situation_t situation_;
};

TEST_F(ChangedBlocks, HaveTheDepthsOfTheSinkOnDemand) {
  situation_.platform.dc_36bit = 1;
  situation_.platform.dc_30bit = 1;
  EXPECT_EQ(support(), 0x38);
  situation_.values.deep_color = 2;
  EXPECT_EQ(support(), 0x38) << "no sink";
  situation_.sink.hdmi = {0x10, 0x00, 0x10};
  EXPECT_EQ(support(), 0x18) << "30 bit only, and Y444 with it, which the sink hasn't";
  EXPECT_EQ(clock(), 190U) << "148.5 x 5 / 4";
  situation_.sink.hdmi = {0x10, 0x00, 0x40};
  EXPECT_EQ(support(), 0x00);
  EXPECT_EQ(clock(), 0U);
  // A sink that cannot be read has none.
  situation_.sink.hdmi = {};
  situation_.sink.video = {16};
  EXPECT_EQ(support(), 0x00);
}

TEST_F(ChangedBlocks, TellNoClockWhereNoneIsNeeded) {
  EXPECT_EQ(clock(), 0U);
  offer({84});  // 165 MHz
  EXPECT_EQ(clock(), 0U);
  offer({85});  // 198 MHz
  EXPECT_EQ(clock(), 200U);
}

TEST_F(ChangedBlocks, TellTheClockOfModesWithinTheBox) {
  offer({95});
  EXPECT_EQ(clock(), 300U);
  situation_.values.tmds_limit = 300;
  situation_.platform.dc_36bit = 1;  // 148.5 x 3 / 2 = 222.75
  EXPECT_EQ(clock(), 300U);
  situation_.platform.tmds_override = 335;
  EXPECT_EQ(clock(), 300U) << "the box takes no more";
  situation_.values.tmds_limit = 340;
  EXPECT_EQ(clock(), 335U);
  situation_.platform.tmds_override = 334;
  EXPECT_EQ(clock(), 330U) << "never above what the platform says";
  situation_.platform.tmds_override = 100;
  EXPECT_EQ(clock(), 300U) << "never below the modes";
  situation_.values.tmds_limit = 600;
  offer({97});
  EXPECT_EQ(clock(), 340U) << "the link carries 600";
}

TEST_F(ChangedBlocks, TellNoMoreThanTheBoxTakesOrTheModesNeed) {
  situation_.platform.dc_36bit = 1;  // 225
  situation_.values.tmds_limit = 200;
  EXPECT_EQ(clock(), 200U);
  situation_.values.tmds_limit = 165;
  situation_.platform.video_60_priority = situation_.platform.video_60_additional =
      observed::modes({63, 16, 4, 1});  // 297 MHz, 445.5 with 36 bit
  EXPECT_EQ(clock(), 300U) << "what the modes need";
  situation_.platform.video_60_priority = {{16, STEREO_FRAME_PACKING}, {4, 0}, {2, 0}, {1, 0}};
  situation_.platform.video_60_additional = {{16, STEREO_FRAME_PACKING}, {4, 0}, {2, 0}, {1, 0}};
  EXPECT_EQ(clock(), 300U) << "297 MHz with frame packing";
}

TEST_F(ChangedBlocks, TellNoMoreThanTheSinkTakesOnDemand) {
  situation_.platform.dc_36bit = 1;
  situation_.platform.modes_4k_x_2k_priority = situation_.platform.modes_4k_x_2k_addition = {};
  situation_.sink.hdmi = {0x10, 0x00, 0x20, 42};  // 36 bit, 210 MHz
  EXPECT_EQ(clock(), 225U);
  situation_.values.deep_color = 2;
  EXPECT_EQ(clock(), 210U);
  situation_.sink.hdmi = {0x10, 0x00, 0x20, 20};
  EXPECT_EQ(clock(), 150U) << "what the modes need";
  situation_.sink.hdmi = {0x10, 0x00, 0x20};
  EXPECT_EQ(clock(), 225U) << "a sink that tells none";
}

TEST_F(ChangedBlocks, LeaveOut3dStructuresThatTheLengthCannotHold) {
  const auto offer_3d = [&](u32 count) {
    std::vector<test_support::mode_pair_t> modes;
    // No mode with mandatory structures; each takes FP, SBSH with its detail, TBH: 4 bytes.
    for (u32 vic = 1; vic <= count; ++vic)
      modes.emplace_back(vic == 4 || vic == 5 ? 40 + vic : vic, 7);
    situation_.platform.video_60_priority = situation_.platform.video_60_additional = modes;
  };
  situation_.settings.hdmi_3d_mode = 2;
  offer_3d(5);  // 8 + 2 + 20
  const std::optional<bytes_t> block = compose(situation_).block(vendor_specific, {0x03, 0x0C, 0x00});
  EXPECT_EQ(block->size(), 30U);
  EXPECT_EQ(block->at(9), 20);
  offer_3d(6);
  const composed_t composed = compose(situation_);
  expect_line(composed,
              "Leaving out the 3D structures that are not mandatory for lack of room. Bytes too many for "
              "the HDMI block:3");
  EXPECT_EQ(composed.block(vendor_specific, {0x03, 0x0C, 0x00})->size(), 10U);
  EXPECT_EQ(composed.tmds_clock(), 0U) << "twice 54 MHz with frame packing";
}

// The base block.

TEST_F(ChangedBlocks, WidenTheRangeLimits) {
  const auto limits = [&] { return compose(situation_).from(113, 5); };
  EXPECT_EQ(limits(), (bytes_t{49, 61, 15, 70, 15}));
  offer({95, 93});  // 30 Hz at 67.5 kHz, 24 Hz at 54 kHz
  EXPECT_EQ(limits(), (bytes_t{24, 61, 15, 70, 30}));
  situation_.values.tmds_limit = 600;
  offer({97});
  EXPECT_EQ(limits(), (bytes_t{49, 61, 15, 135, 60}));
  offer({78});  // 1920x1080 at 120 Hz
  EXPECT_EQ(limits(), (bytes_t{49, 120, 15, 135, 30}));
  // In 4:2:0 only, by the whole clock.
  situation_.values.tmds_limit = 300;
  situation_.values.y420 = 1;
  offer({97});
  EXPECT_EQ(limits(), (bytes_t{49, 61, 15, 135, 60}));
  situation_.values.vrr = 1;
  situation_.values.vrr_min = 20;
  situation_.values.vrr_max = 300;
  EXPECT_EQ(limits(), (bytes_t{20, 255, 15, 135, 60}));
}

TEST_F(ChangedBlocks, PutAnExtendedModeFirstOnDemand) {
  situation_.values.tmds_limit = 600;
  offer({93, 102, 97, 95});
  const bytes_t of_today = compose(situation_).from(54, 36);
  situation_.values.preferred_extended = 1;
  const bytes_t timings = compose(situation_).from(54, 36);
  // 594 MHz, 3840 + 560, 2160 + 90; 93 has a front porch of 1276 pixels, 102 has 4096.
  EXPECT_EQ(bytes_t(timings.begin(), timings.begin() + 18),
            (bytes_t{0x08, 0xE8, 0x00, 0x30, 0xF2, 0x70, 0x5A, 0x80, 0xB0, 0x58, 0x8A, 0x00, 0xC4, 0x8E, 0x21, 0x00,
                     0x00, 0x1E}));
  EXPECT_EQ(bytes_t(timings.begin() + 18, timings.end()), bytes_t(of_today.begin(), of_today.begin() + 18));
  offer({93, 102});
  EXPECT_EQ(compose(situation_).from(54, 36), of_today);
}

TEST_F(ChangedBlocks, EndWithCountAndChecksumAlsoWithoutAName) {
  situation_.platform.monitor_name = "";
  const composed_t composed = compose(situation_);
  bytes_t dummy(18, 0);
  dummy[3] = 0x10;
  EXPECT_EQ(composed.from(90, 18), dummy);
  EXPECT_EQ(composed.from(108, 5), (bytes_t{0, 0, 0, 0xFD, 0}));
}

TEST_F(ChangedBlocks, HaveNoLineFeedAfterAFullSerialText) {
  situation_.platform.monitor_serial = "0123456789ABC";
  const composed_t composed = compose(situation_);
  // Header 4, speakers 4, modes 5, audio 4, HDMI 9, video capability 3; then a timing.
  EXPECT_EQ(composed.bytes[130], 29);
  EXPECT_EQ(composed.from(128 + 47, 19),
            (bytes_t{0, 0, 0, 0xFF, 0, '0', '1', '2', '3', '4', '5', '6', '7', '8', '9', 'A', 'B', 'C', 0}));
}

}  // namespace
}  // namespace hdmi2_test

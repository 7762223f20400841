// What is left out, in which order, so that the rest fits before byte 110 of the extension.
#include "edid_composer/hdmi2/layer_composition.h"

namespace hdmi2_test {
namespace {

using test_support::data_block;

/// Data blocks of a full extension: header 4, speakers 4, audio 1 + 30, HDMI 1 + 8, video capability 1 + 2, and the
/// modes with a header.
class Room : public testing::Test {
 protected:
  Room() {
    situation_.platform.audio = {observed::pcm_2};
    for (i32 type = 2; type <= 10; ++type)
      situation_.platform.audio.push_back(0x700 | type << 3 | 5);
    offer_modes(31);
  }
  /// VICs from 6 on: none has mandatory 3D structures but 16, 19, 20 and 31.
  void offer_modes(u32 count, u32 stereo = 0) {
    std::vector<test_support::mode_pair_t> modes;
    for (u32 i = 0; i < count; ++i)
      modes.emplace_back(first_vic + i, stereo);
    situation_.platform.video_60_priority = situation_.platform.video_60_additional = modes;
  }
  /// The sink's four blocks, which take 10 + 8 + 6 + 10 bytes.
  void pass_on_everything() {
    situation_.sink.video = {16};
    situation_.sink.blocks = {data_block(vendor_specific, {0x1A, 0, 0, 1, 2, 3, 4, 5, 6}),
                              data_block(extended, {0x07, 3, 1, 0, 0, 0, 0}),
                              data_block(extended, {0x01, 0x8B, 0x84, 0x90, 0x01}),
                              data_block(extended, {0x01, 0x46, 0xD0, 0x00, 0x00, 0, 0, 0, 0})};
    hdmi2_values_t &values = situation_.values;
    values.pass_freesync = values.pass_hdr_dynamic = values.pass_hdr10plus = values.pass_dolby_vision = 1;
    values.vrr = 2;
  }
  static std::vector<std::string> left_out(const composed_t &composed) {
    std::vector<std::string> texts;
    const std::string mark = "WARNING: Leaving out ";
    for (std::size_t at = composed.lines.find(mark); at != std::string::npos; at = composed.lines.find(mark, at + 1)) {
      const std::size_t begin = at + mark.size();
      texts.push_back(composed.lines.substr(begin, composed.lines.find('\n', begin) - begin));
    }
    return texts;
  }

  static constexpr u32 first_vic = 6;
  layer_situation_t situation_;
};

TEST_F(Room, IsThereFor109Bytes) {
  // 4 + 4 + 32 + 31 + 9 + 3 = 83; colorimetry 4, HDR 4 + 3: 94; HDMI Forum 11: 105.
  situation_.values.bt2020_rgb = situation_.values.hdr_pq = 1;
  situation_.values.hdr_luminance = 1;
  situation_.values.vrr = 1;
  EXPECT_EQ(compose(situation_).bytes[130], 105);
  EXPECT_EQ(compose(situation_).lines, "");
  // Latencies: 109.
  situation_.settings.edid_latency[2] = 20;
  const composed_t full = compose(situation_);
  EXPECT_EQ(full.bytes[130], 109);
  EXPECT_EQ(full.lines, "");
  // A 4Kx2K mode takes three bytes more.
  situation_.platform.modes_4k_x_2k_priority = situation_.platform.modes_4k_x_2k_addition = {1};
  const composed_t composed = compose(situation_);
  EXPECT_EQ(composed.bytes[130], 109);
  EXPECT_EQ(left_out(composed),
            (std::vector<std::string>{"VIC:36 2880x480p60Hz16x9 for lack of room. Bytes missing:3",
                                      "VIC:35 2880x480p60Hz4x3 for lack of room. Bytes missing:2",
                                      "VIC:34 1920x1080p30Hz16x9 for lack of room. Bytes missing:1"}));
  EXPECT_EQ(composed.svds().size(), 28U);
}

TEST_F(Room, IsMadeInItsOrder) {
  pass_on_everything();
  // 83 + 10 + 8 + 6 + 10 = 117: FreeSync is enough.
  composed_t composed = compose(situation_);
  EXPECT_EQ(left_out(composed), (std::vector<std::string>{"the FreeSync block for lack of room. Bytes missing:8"}));
  EXPECT_EQ(composed.bytes[130], 107);
  EXPECT_FALSE(composed.block(vendor_specific, {0x1A, 0, 0}).has_value());
  EXPECT_TRUE(composed.block(extended, {0x07}).has_value());
  // HDR 7, colorimetry 4, HDMI Forum 8: 136.
  situation_.values.hdr_pq = situation_.values.bt2020_rgb = situation_.values.hdr_luminance = situation_.values.scdc =
      1;
  composed = compose(situation_);
  EXPECT_EQ(left_out(composed),
            (std::vector<std::string>{"the FreeSync block for lack of room. Bytes missing:27",
                                      "the HDR dynamic metadata block for lack of room. Bytes missing:17",
                                      "the HDR10+ block for lack of room. Bytes missing:9",
                                      "the Dolby Vision block for lack of room. Bytes missing:3"}));
  EXPECT_EQ(composed.bytes[130], 102);
}

TEST_F(Room, IsMadeOf3dStructuresBeforeModes) {
  situation_.settings.hdmi_3d_mode = 2;
  situation_.values.hdr_pq = situation_.values.bt2020_rgb = situation_.values.hdr_luminance = situation_.values.scdc =
      1;
  offer_modes(31);
  // Frame packing of five modes takes 5 bytes beside the 2 of 3D: 83 + 19 + 2 + 5 = 109.
  auto &modes = situation_.platform.video_60_priority;
  for (u32 i = 0; i < 5; ++i)
    modes[i].second = STEREO_FRAME_PACKING;
  situation_.platform.video_60_additional = modes;
  EXPECT_EQ(compose(situation_).lines, "");
  EXPECT_EQ(compose(situation_).bytes[130], 109);
  modes[5].second = STEREO_FRAME_PACKING;
  situation_.platform.video_60_additional = modes;
  const composed_t composed = compose(situation_);
  expect_line(composed, "Leaving out the 3D structures that are not mandatory for lack of room. Bytes missing:1");
  EXPECT_EQ(composed.bytes[130], 104);
  EXPECT_EQ(composed.svds().size(), 31U);
}

TEST_F(Room, InTheVideoBlockIsFor31ModesOfWhichTheExtendedOnesStay) {
  situation_.name({97, 96, 95});
  situation_.add({97, 96, 95});
  situation_.values.tmds_limit = 600;
  offer_modes(30);
  const composed_t composed = compose(situation_);
  EXPECT_EQ(
      left_out(composed),
      (std::vector<std::string>{"VIC:35 2880x480p60Hz4x3 for lack of room. Modes too many for the video block:2",
                                "VIC:34 1920x1080p30Hz16x9 for lack of room. Modes too many for the video block:1"}));
  const bytes_t svds = composed.svds();
  EXPECT_EQ(svds.size(), 31U);
  EXPECT_EQ(bytes_t(svds.end() - 4, svds.end()), (bytes_t{33, 97, 96, 95}));
}

TEST_F(Room, IsMadeOfExtendedModesOnlyWhenFourOthersAreLeft) {
  std::vector<i32> vics;
  for (i32 vic = 65; vic <= 95; ++vic)
    vics.push_back(vic);
  situation_.name(vics);
  situation_.add(vics);
  const composed_t composed = compose(situation_);
  const bytes_t svds = composed.svds();
  ASSERT_EQ(svds.size(), 31U);
  EXPECT_EQ(bytes_t(svds.begin(), svds.begin() + 5), (bytes_t{0x80 | 6, 7, 8, 9, 65}));
  EXPECT_EQ(svds.back(), 93) << "27 of 29; 91 and 92 take more than 340 MHz";
}

TEST_F(Room, ForASerialTextIsNotMadeOfAnythingElse) {
  situation_.platform.monitor_serial = "0001";
  offer_modes(31);
  // 83 bytes, a timing and the text: 119.
  EXPECT_EQ(compose(situation_).lines, "");
  situation_.values.scdc = 1;
  EXPECT_EQ(compose(situation_).lines, "") << "91 + 36 = 127";
  situation_.values.allm = 1;
  expect_line(compose(situation_), "Leaving out the serial number text for lack of room. Bytes missing:1");
}

TEST_F(Room, LeavesARateToTheModesThatAreLeft) {
  // 28 modes of the box, the last of them, which has no room, above 340 MHz.
  std::vector<i32> vics;
  for (i32 vic = 65; vic <= 90; ++vic)
    vics.push_back(vic);
  vics.push_back(93);
  vics.push_back(97);
  situation_.name(vics);
  situation_.add(vics);
  situation_.values.tmds_limit = 600;
  situation_.sink.video = {16};
  const composed_t composed = compose(situation_);
  EXPECT_EQ(composed.svds().back(), 93);
  EXPECT_FALSE(composed.forum().has_value());
  EXPECT_EQ(composed.tmds_clock(), 300U);
  EXPECT_EQ(composed.from(113, 5), (bytes_t{24, 120, 15, 135, 30})) << "nor do the range limits hold it";
}

}  // namespace
}  // namespace hdmi2_test

// The data blocks of HDMI 2 that are offered, byte for byte.
#include "edid_composer/hdmi2/layer_composition.h"

namespace hdmi2_test {
namespace {

using test_support::data_block;

class OfferedBlocks : public testing::Test {
 protected:
  OfferedBlocks() { situation_.sink.video = {16}; }
  /// The bytes after the OUI.
  std::optional<bytes_t> forum() {
    const std::optional<bytes_t> payload = compose(situation_).forum();
    if (!payload) return std::nullopt;
    return bytes_t(payload->begin() + 3, payload->end());
  }
  std::optional<bytes_t> extended_block(u8 tag) { return compose(situation_).block(extended, {tag}); }

  layer_situation_t situation_;
};

// The HDMI Forum block.

TEST_F(OfferedBlocks, OfTheForumAreThereOnlyWithSomethingToSay) {
  EXPECT_FALSE(forum().has_value());
  situation_.values.read_request = situation_.values.scramble_low = 1;
  EXPECT_FALSE(forum().has_value()) << "both need SCDC";
  situation_.values.scdc = 1;
  EXPECT_EQ(forum(), (bytes_t{1, 0, 0xC8, 0}));
  situation_.values.read_request = situation_.values.scramble_low = 0;
  EXPECT_EQ(forum(), (bytes_t{1, 0, 0x80, 0}));
}

TEST_F(OfferedBlocks, OfTheForumTellNoReadRequestsOrScramblingWithoutScdc) {
  situation_.values.read_request = situation_.values.scramble_low = 1;
  situation_.values.allm = 1;
  EXPECT_EQ(forum(), (bytes_t{1, 0, 0, 0, 0x02}));
}

TEST_F(OfferedBlocks, OfTheForumTellNoDepthForAModeThatIsLeftOut) {
  situation_.name({97});
  situation_.add({97});
  situation_.values.y420 = situation_.values.dc_30bit_420 = 1;
  situation_.values.tmds_limit = 600;
  situation_.sink.blocks = {forum_block(120)};
  EXPECT_EQ(forum(), (bytes_t{1, 120, 0x80, 0x01}));
  situation_.platform.geometry_limit = 1;
  EXPECT_EQ(forum(), (bytes_t{1, 120, 0x80, 0})) << "2160 lines are more than the sink's 1080";
}

TEST_F(OfferedBlocks, OfTheForumTellARateAbove340Mhz) {
  situation_.sink.blocks = {forum_block(120)};
  situation_.values.tmds_limit = 340;
  EXPECT_FALSE(forum().has_value());
  situation_.values.tmds_limit = 341;
  EXPECT_EQ(forum(), (bytes_t{1, 345 / 5, 0x80, 0}));
  EXPECT_EQ(compose(situation_).tmds_clock(), 340U);
  situation_.values.tmds_limit = 600;
  situation_.sink.blocks = {forum_block(119)};
  EXPECT_EQ(forum(), (bytes_t{1, 119, 0x80, 0}));
}

TEST_F(OfferedBlocks, OfTheForumTellLowLatencyAndRefreshRates) {
  situation_.values.allm = 2;
  EXPECT_FALSE(forum().has_value());
  situation_.sink.blocks = {forum_block(0, 0, {0x02})};
  EXPECT_EQ(forum(), (bytes_t{1, 0, 0, 0, 0x02}));
  situation_.values.vrr = 1;
  situation_.values.vrr_max = 0x2A5;
  EXPECT_EQ(forum(), (bytes_t{1, 0, 0, 0, 0x02, 0x80 | 48, 0xA5}));
  situation_.values.allm = 0;
  EXPECT_EQ(forum(), (bytes_t{1, 0, 0, 0, 0x00, 0x80 | 48, 0xA5}));
}

TEST_F(OfferedBlocks, OfTheForumTellWhatIsLeftOfBothRangesOfRefreshRates) {
  struct case_t {
    i32 own_min, own_max;
    u8 sink_min;
    u32 sink_max;
    std::optional<std::pair<u8, u32>> told;
  };
  situation_.values.vrr = 2;
  for (const auto &[own_min, own_max, sink_min, sink_max, told] : std::vector<case_t>{
           {48, 0, 40, 120, {{48, 120}}},
           {24, 100, 40, 0, {{40, 100}}},
           {1, 0, 1, 0, {{1, 0}}},
           {1, 144, 48, 120, {{48, 120}}},
           {1, 1023, 30, 1023, {{30, 1023}}},
           {1, 99, 48, 120, std::nullopt},
           {1, 0, 49, 120, std::nullopt},
       }) {
    situation_.values.vrr_min = own_min;
    situation_.values.vrr_max = own_max;
    situation_.sink.blocks = {
        forum_block(0, 0, {0, static_cast<u8>(sink_min | sink_max >> 8 << 6), static_cast<u8>(sink_max & 0xFF)})};
    const composed_t composed = compose(situation_);
    const std::optional<bytes_t> block = composed.forum();
    ASSERT_EQ(block.has_value(), told.has_value()) << own_min << " " << own_max;
    if (told) {
      EXPECT_EQ(block->at(8), told->first | told->second >> 8 << 6);
      EXPECT_EQ(block->at(9), told->second & 0xFF);
      EXPECT_EQ(composed.lines, "");
    } else {
      expect_line(composed, "The range of the variable refresh rate is not valid.");
    }
  }
  // A minimum of 0 is no VRR, without a word.
  situation_.sink.blocks = {forum_block(0, 0, {0, 0, 120})};
  EXPECT_FALSE(forum().has_value());
  EXPECT_EQ(compose(situation_).lines, "");
}

TEST_F(OfferedBlocks, OfTheForumTellDepthsIn420WithinTheRate) {
  situation_.values.y420 = 1;
  situation_.name({97});
  situation_.add({97});
  situation_.values.dc_30bit_420 = situation_.values.dc_36bit_420 = 2;
  situation_.sink.blocks = {forum_block(120, 0x03)};
  // 594 / 2 x 5 / 4 = 371.25, x 3 / 2 = 445.5.
  for (const auto &[limit, flags] : std::vector<std::pair<i32, u8>>{{370, 0}, {375, 1}, {445, 1}, {450, 3}, {600, 3}}) {
    situation_.values.tmds_limit = limit;
    EXPECT_EQ(forum()->at(3), flags) << limit;
  }
  situation_.sink.blocks = {forum_block(120, 0x02)};
  const composed_t composed = compose(situation_);
  EXPECT_EQ(composed.forum()->at(6), 0x03);
  expect_line(composed, "36 bit in 4:2:0 is offered without 30 bit");
}

TEST_F(OfferedBlocks, OfTheForumTellTheVicsOf4kModesThatAreOfferedTwice) {
  situation_.values.scdc = 1;
  situation_.name({95, 94, 93, 98});
  situation_.add({95, 94, 93, 98});
  for (const auto &[hdmi_vic, vic] : std::vector<std::pair<i32, i32>>{{1, 95}, {2, 94}, {3, 93}, {4, 98}}) {
    situation_.platform.modes_4k_x_2k_priority = situation_.platform.modes_4k_x_2k_addition = {hdmi_vic};
    situation_.name({vic});
    EXPECT_EQ(forum()->at(3), 0x08) << hdmi_vic;
    situation_.name({vic == 95 ? 94 : 95});
    EXPECT_EQ(forum()->at(3), 0x00) << hdmi_vic;
  }
  situation_.name({98});
  situation_.values.uhd_vic = 0;
  EXPECT_EQ(forum()->at(3), 0x00);
}

// Pictures.

TEST_F(OfferedBlocks, OfVideoCapabilityAreAlwaysThere) {
  EXPECT_EQ(extended_block(0x00), (bytes_t{0x00, 0x0F}));
  situation_.platform.underscan = 1;
  EXPECT_EQ(extended_block(0x00), (bytes_t{0x00, 0x0A}));
  situation_.sink.blocks = {data_block(extended, {0x00, 0xD5})};
  EXPECT_EQ(extended_block(0x00), (bytes_t{0x00, 0xCA})) << "both ranges as the sink, scan as the platform";
  situation_.values.ycc_quantization = 0;
  EXPECT_EQ(extended_block(0x00), (bytes_t{0x00, 0x4A}));
}

TEST_F(OfferedBlocks, OfColorimetryJoinBothKindsOfKeys) {
  EXPECT_FALSE(extended_block(0x05).has_value());
  situation_.platform.xvYCC709 = 1;
  EXPECT_EQ(extended_block(0x05), (bytes_t{0x05, 0x02, 0x01}));
  situation_.sink.blocks = {data_block(extended, {0x05, 0xFF, 0x01})};
  situation_.values.bt2020_rgb = situation_.values.bt2020_cycc = 2;
  EXPECT_EQ(extended_block(0x05), (bytes_t{0x05, 0xA2, 0x01}));
  situation_.platform.xvYCC709 = 0;
  situation_.values.bt2020_ycc = 1;
  EXPECT_EQ(extended_block(0x05), (bytes_t{0x05, 0xE0, 0x00}));
}

TEST_F(OfferedBlocks, OfHdrTakeTheSinksOnlyWithItsMetadata) {
  situation_.values.hdr_gamma = situation_.values.hdr_pq = situation_.values.hdr_hlg = 2;
  situation_.values.bt2020_ycc = 1;
  EXPECT_FALSE(extended_block(0x06).has_value());
  situation_.sink.blocks = {data_block(extended, {0x06, 0x3F, 0x00, 120, 90})};
  EXPECT_FALSE(extended_block(0x06).has_value()) << "it takes no metadata of type 1";
  situation_.sink.blocks = {data_block(extended, {0x06, 0x3F, 0x03, 120, 90})};
  EXPECT_EQ(extended_block(0x06), (bytes_t{0x06, 0x0F, 0x01, 120, 90}));
  situation_.values.hdr_luminance = 0;
  EXPECT_EQ(extended_block(0x06), (bytes_t{0x06, 0x0F, 0x01}));
  situation_.values.hdr_luminance = 1;
  situation_.values.hdr_max = 255;
  situation_.values.hdr_min = 7;
  EXPECT_EQ(extended_block(0x06), (bytes_t{0x06, 0x0F, 0x01, 255, 0, 7}));
}

TEST_F(OfferedBlocks, OfHdrWithoutBt2020AreWarnedOfWhereThePlatformWantsThem) {
  situation_.values.hdr_gamma = 1;
  EXPECT_EQ(compose(situation_).lines, "") << "no wide colours belong to it";
  situation_.values.hdr_hlg = 1;
  expect_line(compose(situation_), "HDR is offered without BT.2020");
  situation_.values.bt2020_cycc = 1;
  expect_line(compose(situation_), "HDR is offered without BT.2020");
  situation_.values.bt2020_rgb = 1;
  EXPECT_EQ(compose(situation_).lines, "");
  situation_.values.bt2020_rgb = 0;
  situation_.values.hdr_hlg = 2;
  situation_.sink.blocks = {data_block(extended, {0x06, 0x09, 0x01})};
  EXPECT_EQ(compose(situation_).lines, "") << "as the sink has it";
}

// Blocks that are passed on.

TEST_F(OfferedBlocks, ThatArePassedOnStandAsInTheSink) {
  const bytes_t hdr_dynamic = data_block(extended, {0x07, 3, 1, 0});
  const bytes_t hdr10plus = data_block(extended, {0x01, 0x8B, 0x84, 0x90, 0x01});
  const bytes_t freesync = data_block(vendor_specific, {0x1A, 0, 0, 1, 2, 3, 4, 5});
  situation_.sink.blocks = {freesync, hdr10plus, hdr_dynamic};
  EXPECT_EQ(compose(situation_).blocks().size(), 5U) << "speakers, video, audio, HDMI, video capability";
  situation_.values.pass_hdr_dynamic = situation_.values.pass_hdr10plus = situation_.values.pass_freesync = 1;
  situation_.values.vrr = 2;
  const std::vector<bytes_t> blocks = compose(situation_).blocks();
  EXPECT_EQ(std::vector<bytes_t>(blocks.begin() + 5, blocks.end()),
            (std::vector<bytes_t>{hdr_dynamic, hdr10plus, freesync}));
}

TEST_F(OfferedBlocks, OfDolbyVisionNeedTheRateThatTheyAnnounce) {
  situation_.values.pass_dolby_vision = 1;
  situation_.values.tmds_limit = 600;
  const auto passed = [&](u8 version_byte, u8 rate) {
    situation_.sink.blocks = {forum_block(rate),
                              data_block(extended, {0x01, 0x46, 0xD0, 0x00, version_byte, 0, 0, 0, 0})};
    return compose(situation_).block(extended, {0x01}).has_value();
  };
  EXPECT_TRUE(passed(0x02, 119)) << "595 MHz";
  EXPECT_FALSE(passed(0x02, 118)) << "590 MHz";
  EXPECT_TRUE(passed(0x00, 60));
  EXPECT_FALSE(passed(0x22, 60)) << "version 1";
  EXPECT_TRUE(passed(0x42, 60)) << "version 2 has another bit there";
}

TEST_F(OfferedBlocks, OfFreesyncNeedTheSinksOwnRange) {
  situation_.values.pass_freesync = 1;
  situation_.values.vrr = 2;
  situation_.values.vrr_min = 1;
  const auto passed = [&](const bytes_t &range) {
    situation_.sink.blocks = {forum_block(0, 0, range), data_block(vendor_specific, {0x1A, 0, 0, 1, 2, 3, 4, 5})};
    return compose(situation_).block(vendor_specific, {0x1A, 0, 0}).has_value();
  };
  EXPECT_TRUE(passed({0, 48, 120}));
  EXPECT_TRUE(passed({})) << "it has none, none is offered";
  EXPECT_TRUE(passed({0, 0, 120}));
  EXPECT_FALSE(passed({0, 48, 60})) << "not a valid range";
  situation_.values.vrr_max = 100;
  EXPECT_FALSE(passed({0, 48, 120})) << "narrowed";
  situation_.values.vrr = 1;
  situation_.values.vrr_min = 48;
  situation_.values.vrr_max = 120;
  EXPECT_FALSE(passed({0, 48, 120})) << "the box's own, though the same";
}

TEST_F(OfferedBlocks, StandInTheirOrder) {
  situation_.values.tmds_limit = 600;
  situation_.values.hdr_pq = situation_.values.bt2020_rgb = 1;
  situation_.values.y420 = 1;
  situation_.name({97, 119});
  situation_.add({97, 119});
  std::vector<bytes_t> blocks = compose(situation_).blocks();
  std::vector<std::pair<u8, u8>> tags;
  for (const bytes_t &block : blocks)
    tags.emplace_back(block[0] >> 5, block[0] >> 5 == extended ? block[1] : 0);
  // 119 takes 1188 MHz, in 4:2:0 594.
  EXPECT_EQ(tags, (std::vector<std::pair<u8, u8>>{
                      {4, 0}, {2, 0}, {1, 0}, {3, 0}, {3, 0}, {7, 0x00}, {7, 0x05}, {7, 0x06}, {7, 0x0E}, {7, 0x0F}}));
}

}  // namespace
}  // namespace hdmi2_test

// Which modes above VIC 64 are offered, where, and what that makes of the rates.
#include "edid_composer/hdmi2/layer_composition.h"

namespace hdmi2_test {
namespace {

using test_support::data_block;

const bytes_t base_modes{0x90, 4, 2, 1};

bytes_t with_base(const bytes_t &codes) {
  return test_support::join(base_modes, codes);
}

bytes_t video_420(const bytes_t &vics) {
  return data_block(extended, test_support::join({0x0E}, vics));
}

bytes_t map_420(const bytes_t &bytes) {
  return data_block(extended, test_support::join({0x0F}, bytes));
}

class ExtendedModes : public testing::Test {
 protected:
  std::optional<bytes_t> block_420(const composed_t &composed) { return composed.block(extended, {0x0E}); }
  std::optional<bytes_t> map(const composed_t &composed) { return composed.block(extended, {0x0F}); }

  layer_situation_t situation_;
};

TEST_F(ExtendedModes, AreOnlyThoseOfThePriorityList) {
  situation_.sink.video = {16, 95, 97};
  situation_.sink.blocks = {forum_block(120)};
  situation_.values.tmds_limit = 600;
  EXPECT_EQ(compose(situation_).svds(), base_modes);
  situation_.name({97, 95, 97, 96});
  EXPECT_EQ(compose(situation_).svds(), with_base({97, 95})) << "in its order, once, and none that nobody has";
}

TEST_F(ExtendedModes, OfTheBoxNeedItsReceiverOnly) {
  situation_.name({97, 193, 219});
  situation_.add({97, 219});
  situation_.sink.video = {16};
  situation_.values.tmds_limit = 591;
  // 594 MHz and a receiver of 595.
  const composed_t composed = compose(situation_);
  EXPECT_EQ(composed.svds(), with_base({97})) << "219 has 1188 MHz";
  EXPECT_EQ(composed.forum()->at(4), 595 / 5) << "what the box needs, although the sink takes 165 MHz";
  situation_.values.tmds_limit = 590;
  EXPECT_EQ(compose(situation_).svds(), base_modes);
}

TEST_F(ExtendedModes, OfTheSinkNeedBothRates) {
  situation_.name({95, 77});
  situation_.sink.video = {16, 95, 77};
  situation_.sink.hdmi = {0x10, 0x00, 0, 59};  // 295 MHz
  EXPECT_EQ(compose(situation_).svds(), base_modes) << "297 MHz each";
  situation_.sink.hdmi = {0x10, 0x00, 0, 60};
  EXPECT_EQ(compose(situation_).svds(), with_base({95, 77}));
  situation_.values.tmds_limit = 290;
  EXPECT_EQ(compose(situation_).svds(), base_modes);
  situation_.values.tmds_limit = 296;
  EXPECT_EQ(compose(situation_).svds(), with_base({95, 77})) << "rounded up to 300";
  // The rate of the HDMI Forum block goes before that of the HDMI block.
  situation_.sink.blocks = {forum_block(40)};
  EXPECT_EQ(compose(situation_).svds(), base_modes);
}

TEST_F(ExtendedModes, OfASinkThatSaysNoRateStayAt165Mhz) {
  situation_.name({84, 85});  // 165 and 198 MHz
  situation_.sink.video = {16, 84, 85};
  EXPECT_EQ(compose(situation_).svds(), with_base({84}));
  situation_.platform.is_tv = 1;
  EXPECT_EQ(compose(situation_).svds(), with_base({84, 85})) << "a television has no sink to spare";
}

TEST_F(ExtendedModes, WithoutASinkAreThoseOfTheBox) {
  situation_.name({97, 96});
  situation_.add({96});
  situation_.values.tmds_limit = 600;
  EXPECT_EQ(compose(situation_).svds(), with_base({96}));
}

TEST_F(ExtendedModes, OfAnySvdOfTheSinkAreFoundAsTheyStand) {
  situation_.name({120, 64 + 1, 194});
  // 0xC2 is VIC 194; 0x90, 16 with its native flag, is no 144.
  situation_.sink.video = {0x90, 65, 0xC2};
  situation_.sink.blocks = {forum_block(120)};
  situation_.values.tmds_limit = 600;
  EXPECT_EQ(compose(situation_).svds(), with_base({65})) << "194 takes 1188 MHz";
}

TEST_F(ExtendedModes, TallerThanTheSinkAreLeftOutOnDemand) {
  situation_.platform.geometry_limit = 1;
  situation_.name({76, 97});
  situation_.add({76, 97});
  situation_.values.tmds_limit = 600;
  situation_.sink.video = {16, 4, 2, 1};
  EXPECT_EQ(compose(situation_).svds(), with_base({76})) << "1080 lines";
  // Any descriptor counts, those above VIC 64 included.
  situation_.sink.video = {16, 4, 2, 1, 96};
  EXPECT_EQ(compose(situation_).svds(), with_base({76, 97}));
}

TEST_F(ExtendedModes, Take420OnlyFrom590MhzOn) {
  situation_.values.y420 = 1;
  situation_.name({97, 95});
  situation_.add({97, 95});
  situation_.values.tmds_limit = 296;
  // 594 / 2 = 297 MHz within 300; 297 MHz take no 4:2:0.
  const composed_t composed = compose(situation_);
  EXPECT_EQ(composed.svds(), with_base({95}));
  EXPECT_EQ(block_420(composed), (bytes_t{0x0E, 97}));
  EXPECT_FALSE(map(composed).has_value());
  situation_.values.tmds_limit = 295;
  EXPECT_FALSE(block_420(compose(situation_)).has_value());
}

TEST_F(ExtendedModes, Take420AsTheSinkByItsBlockOrItsMap) {
  situation_.values.y420 = 2;
  situation_.name({97, 96, 102});
  situation_.sink.video = {16, 96, 97, 102};
  situation_.sink.blocks = {forum_block(60), video_420({102}), map_420({0x04})};
  const composed_t composed = compose(situation_);
  EXPECT_EQ(composed.svds(), base_modes);
  EXPECT_EQ(block_420(composed), (bytes_t{0x0E, 97, 102})) << "bit 2 marks 97, the third descriptor";
  // An empty map marks all.
  situation_.sink.blocks = {forum_block(60), map_420({})};
  EXPECT_EQ(block_420(compose(situation_)), (bytes_t{0x0E, 97, 96, 102}));
  situation_.values.y420 = 0;
  EXPECT_FALSE(block_420(compose(situation_)).has_value());
  // Never without a sink.
  situation_.values.y420 = 2;
  situation_.sink = {};
  EXPECT_FALSE(block_420(compose(situation_)).has_value());
}

TEST_F(ExtendedModes, OfTheBoxIn420RaiseItsRate) {
  situation_.values.y420 = 1;
  situation_.name({97});
  situation_.add({97});
  situation_.sink.video = {16};
  const composed_t composed = compose(situation_);
  EXPECT_EQ(block_420(composed), (bytes_t{0x0E, 97}));
  EXPECT_EQ(composed.tmds_clock(), 300U);
  EXPECT_FALSE(composed.forum().has_value()) << "300 MHz stand in the HDMI block";
}

TEST_F(ExtendedModes, AreMarkedInTheMapWhereTheyTake420Too) {
  situation_.values.y420 = 2;
  situation_.name({95, 97, 96, 94, 93, 98, 101});
  situation_.sink.video = {16, 93, 94, 95, 96, 97, 98, 101};
  situation_.sink.blocks = {forum_block(120), map_420({0xA0})};  // 97 and 101
  situation_.values.tmds_limit = 600;
  const composed_t composed = compose(situation_);
  EXPECT_EQ(composed.svds(), with_base({95, 97, 96, 94, 93, 98, 101}));
  // 97 is descriptor 5, 101 descriptor 10.
  EXPECT_EQ(map(composed), (bytes_t{0x0F, 0x20, 0x04}));
}

}  // namespace
}  // namespace hdmi2_test

// Comparing audio formats with those of a list and of a sink.
#include "edid_composer/selection/audio_matching.h"

#include <gtest/gtest.h>

#include <optional>

#include "support/records.h"

namespace {

using edid_composer::_audio_format_in_downstream_sink;
using edid_composer::_audio_format_in_list;
using edid_composer::is_basic_audio;
using test_support::append;
using test_support::audio_words_t;
using test_support::words_of;

short_audio_desc_t pcm(u32 channels, u32 frequencies = 7, u32 bits = 5) {
  return {1, channels, frequencies, bits, 0, 0, 0};
}

short_audio_desc_t of_type(u32 type, u32 frequencies = 7) {
  return {type, 6, frequencies, 0, 0, 0, 0};
}

class AudioList : public testing::Test {
 protected:
  std::optional<i32> place_of(const short_audio_desc_t &audio) { return _audio_format_in_list(list_.get(), audio); }

  test_support::scoped_list_t<short_audio_desc_t> list_;
};

TEST_F(AudioList, HoldsNothingWhenEmpty) {
  EXPECT_EQ(place_of(pcm(2)), std::nullopt);
  EXPECT_EQ(place_of(of_type(2)), std::nullopt);
}

TEST_F(AudioList, HoldsAFormatOfTheSameTypeWhateverElseDiffers) {
  append(*list_, short_audio_desc_t{2, 2, 1, 0, 64, 0, 0});
  EXPECT_EQ(place_of(short_audio_desc_t{2, 8, 0x7F, 0, 640, 0, 0}), 0);
  EXPECT_EQ(place_of(of_type(3)), std::nullopt);
}

TEST_F(AudioList, HoldsPcmWithAtLeastAsManyChannels) {
  append(*list_, pcm(6));
  EXPECT_EQ(place_of(pcm(2)), 0);
  EXPECT_EQ(place_of(pcm(6)), 0);
  EXPECT_EQ(place_of(pcm(7)), std::nullopt);
  append(*list_, of_type(2));
  append(*list_, pcm(8));
  EXPECT_EQ(place_of(pcm(7)), 2);
}

TEST_F(AudioList, TypesThatStandForNothingCompareLikeOthers) {
  append(*list_, of_type(0));
  EXPECT_EQ(place_of(of_type(0)), 0);
  EXPECT_EQ(place_of(of_type(16)), std::nullopt);
}

TEST(BasicAudio, IsStereoPcmOfAnOrdinaryRate) {
  for (const u32 rate : {1U, 2U, 4U, 0x7FU})
    EXPECT_TRUE(is_basic_audio(pcm(2, rate, 0))) << rate;
  for (const auto &other : {pcm(1), pcm(3), pcm(2, 0x78), pcm(2, 0), of_type(2), of_type(0)})
    EXPECT_FALSE(is_basic_audio(other)) << other.type;
}

class AudioInSink : public testing::Test {
 protected:
  void sink_has(const short_audio_desc_t &audio) { append(sink_->audio_list, audio); }
  /// What the sink leaves of a format; nothing when it has none like it.
  std::optional<audio_words_t> left_of(const short_audio_desc_t &audio) {
    const auto narrowed = _audio_format_in_downstream_sink(sink_.get(), audio);
    return narrowed ? std::optional(words_of(*narrowed)) : std::nullopt;
  }

  test_support::scoped_edid_t sink_;
};

TEST_F(AudioInSink, IsNoneOfAnotherType) {
  sink_has(of_type(3));
  EXPECT_EQ(left_of(of_type(2)), std::nullopt);
}

TEST_F(AudioInSink, IsNoneWithoutACommonSampleRate) {
  sink_has(of_type(2, 0x78));
  EXPECT_EQ(left_of(of_type(2, 0x07)), std::nullopt);
}

TEST_F(AudioInSink, IsNarrowedToTheSmallerOfEachAbility) {
  sink_has({2, 4, 0x0E, 0, 640, 9, 1});
  EXPECT_EQ(left_of({2, 6, 0x07, 7, 448, 12, 3}), (audio_words_t{2, 4, 0x06, 7, 448, 9, 1}));
  EXPECT_EQ(left_of({2, 2, 0x08, 0, 2040, 1, 0}), (audio_words_t{2, 2, 0x08, 0, 640, 1, 0}));
}

TEST_F(AudioInSink, SmallerIsMeantSigned) {
  sink_has({2, 6, 7, 0, 0xFFFFFFFF, 5, 5});
  EXPECT_EQ(left_of({2, 6, 7, 0, 100, 0x80000000, 5}), (audio_words_t{2, 6, 7, 0, 0xFFFFFFFF, 0x80000000, 5}));
}

TEST_F(AudioInSink, IsThatOfTheFirstEntryThatMatches) {
  sink_has(of_type(2, 0x40));
  sink_has({2, 2, 0x03, 0, 0, 0, 0});
  sink_has({2, 8, 0x07, 0, 0, 0, 0});
  EXPECT_EQ(left_of(of_type(2, 0x06)), (audio_words_t{2, 2, 0x02, 0, 0, 0, 0}));
}

TEST_F(AudioInSink, PcmIsNarrowedInRatesAndSampleSizes) {
  sink_has(pcm(2, 0x07, 0x3));
  EXPECT_EQ(left_of(pcm(2, 0x14, 0x5)), words_of(pcm(2, 0x04, 0x1)));
  EXPECT_EQ(left_of(pcm(2, 0x07, 0x4)), std::nullopt);
}

TEST_F(AudioInSink, StereoAndMultichannelPcmNeverMatch) {
  sink_has(pcm(2));
  EXPECT_EQ(left_of(pcm(2)), words_of(pcm(2)));
  for (const u32 channels : {1U, 3U, 8U})
    EXPECT_EQ(left_of(pcm(channels)), std::nullopt) << channels;
}

TEST_F(AudioInSink, MultichannelPcmMatchesMultichannelPcmOnly) {
  sink_has(pcm(6));
  EXPECT_EQ(left_of(pcm(8)), words_of(pcm(6)));
  for (const u32 channels : {1U, 2U})
    EXPECT_EQ(left_of(pcm(channels)), std::nullopt) << channels;
}

TEST_F(AudioInSink, MonoPcmMatchesNothing) {
  sink_has(pcm(1));
  EXPECT_EQ(left_of(pcm(1)), std::nullopt);
}

TEST_F(AudioInSink, SampleSizesOfOtherTypesAreNotCompared) {
  sink_has({2, 2, 7, 0x2, 0, 0, 0});
  EXPECT_EQ(left_of({2, 6, 7, 0x5, 0, 0, 0}), (audio_words_t{2, 2, 7, 0x5, 0, 0, 0}));
}

}  // namespace

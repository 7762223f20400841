// Comparing audio formats with those of a list and of a sink, and masks of audio types.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "composer_lines.h"
#include "edid_composer/audio_formats.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using composer_lines::bug;
using composer_lines::error;
using composer_lines::trace;
using edid_composer::_audio_format_in_downstream_sink;
using edid_composer::_audio_format_in_list;
using edid_composer::_audio_type_to_audio_mask;
using edid_composer::_create_audio_mask;
using edid_composer::_filter_audio_list_with_mask;
using test_support::append;
using test_support::output_of;
using test_support::words_of;

short_audio_desc_t pcm(u32 channels, u32 frequencies = 7, u32 bits = 5) {
  return {1, channels, frequencies, bits, 0, 0, 0};
}

short_audio_desc_t of_type(u32 type, u32 frequencies = 7) {
  return {type, 6, frequencies, 0, 0, 0, 0};
}

TEST(AudioMask, HasABitForEachTypeBut15) {
  EXPECT_EQ(_audio_type_to_audio_mask(0), 0U);
  for (u32 type = 1; type <= 14; ++type)
    EXPECT_EQ(_audio_type_to_audio_mask(type), 1U << (type - 1)) << type;
  EXPECT_EQ(_audio_type_to_audio_mask(15), 0U);
  EXPECT_EQ(_audio_type_to_audio_mask(16), 0x4000U);
  EXPECT_EQ(_audio_type_to_audio_mask(17), 0x8000U);
  EXPECT_EQ(_audio_type_to_audio_mask(18), 0x10000U);
  for (const u32 type : {19U, 32U, 33U, 0x7FFFFFFFU, 0xFFFFFFFFU})
    EXPECT_EQ(_audio_type_to_audio_mask(type), 0U) << type;
}

class AudioList : public testing::Test {
 protected:
  u32 in_list(const short_audio_desc_t &audio) { return _audio_format_in_list(list_.get(), &audio); }

  test_support::scoped_list_t<short_audio_desc_t> list_;
};

TEST_F(AudioList, MaskIsThatOfAllItsTypes) {
  EXPECT_EQ(_create_audio_mask(list_.get()), 0U);
  for (const u32 type : {1U, 1U, 7U, 18U, 0U, 15U, 40U})
    append(*list_, of_type(type));
  EXPECT_EQ(_create_audio_mask(list_.get()), 0x10041U);
}

TEST_F(AudioList, HoldsNothingWhenEmpty) {
  EXPECT_EQ(in_list(pcm(2)), 0U);
  EXPECT_EQ(in_list(of_type(2)), 0U);
}

TEST_F(AudioList, HoldsAFormatOfTheSameTypeWhateverElseDiffers) {
  append(*list_, short_audio_desc_t{2, 2, 1, 0, 64, 0, 0});
  EXPECT_EQ(in_list(short_audio_desc_t{2, 8, 0x7F, 0, 640, 0, 0}), 1U);
  EXPECT_EQ(in_list(of_type(3)), 0U);
}

TEST_F(AudioList, HoldsPcmWithAtLeastAsManyChannels) {
  append(*list_, pcm(6));
  EXPECT_EQ(in_list(pcm(2)), 1U);
  EXPECT_EQ(in_list(pcm(6)), 1U);
  EXPECT_EQ(in_list(pcm(7)), 0U);
  append(*list_, of_type(2));
  append(*list_, pcm(8));
  EXPECT_EQ(in_list(pcm(7)), 1U);
}

TEST_F(AudioList, TypesThatStandForNothingCompareLikeOthers) {
  append(*list_, of_type(0));
  EXPECT_EQ(in_list(of_type(0)), 1U);
  EXPECT_EQ(in_list(of_type(16)), 0U);
}

TEST_F(AudioList, MissingListIsReported) {
  const std::string null_list = test_support::error_line("linked_list", "ll_verify_list_type", "list ptr is NULL.");
  const short_audio_desc_t audio = pcm(2);
  EXPECT_EQ(output_of([&] { EXPECT_EQ(_audio_format_in_list(nullptr, &audio), 0U); }),
            null_list + error("_audio_format_in_list", "The list types don't match.") +
                bug("_audio_format_in_list", "The list:audio_list of type:short_audio_desc_t is NULL."));
  EXPECT_EQ(output_of([&] { EXPECT_EQ(_create_audio_mask(nullptr), 0U); }),
            null_list + error("_create_audio_mask", "The list types don't match.") +
                bug("_create_audio_mask", "The list:list of type:short_audio_desc_t is NULL."));
}

class AudioInSink : public testing::Test {
 protected:
  u32 in_sink(short_audio_desc_t &audio) { return _audio_format_in_downstream_sink(sink_.get(), &audio); }
  u32 in_sink(const short_audio_desc_t &audio) {
    short_audio_desc_t copy = audio;
    return in_sink(copy);
  }

  test_support::scoped_edid_t sink_;
};

TEST_F(AudioInSink, IsRefusedUnchangedWhenTheSinkHasNoneOfItsType) {
  append(sink_->audio_list, of_type(3));
  short_audio_desc_t audio{2, 6, 0x7F, 0, 640, 9, 3};
  EXPECT_EQ(in_sink(audio), 0U);
  EXPECT_EQ(words_of(audio), (test_support::audio_words_t{2, 6, 0x7F, 0, 640, 9, 3}));
}

TEST_F(AudioInSink, IsRefusedUnchangedWithoutACommonSampleRate) {
  append(sink_->audio_list, of_type(2, 0x78));
  short_audio_desc_t audio = of_type(2, 0x07);
  EXPECT_EQ(in_sink(audio), 0U);
  EXPECT_EQ(audio.frequencies, 0x07U);
}

TEST_F(AudioInSink, IsNarrowedToTheSmallerOfEachAbility) {
  append(sink_->audio_list, short_audio_desc_t{2, 4, 0x0E, 0, 640, 9, 1});
  short_audio_desc_t audio{2, 6, 0x07, 7, 448, 12, 3};
  EXPECT_EQ(in_sink(audio), 1U);
  EXPECT_EQ(words_of(audio), (test_support::audio_words_t{2, 4, 0x06, 7, 448, 9, 1}));
  short_audio_desc_t smaller{2, 2, 0x08, 0, 2040, 1, 0};
  EXPECT_EQ(in_sink(smaller), 1U);
  EXPECT_EQ(words_of(smaller), (test_support::audio_words_t{2, 2, 0x08, 0, 640, 1, 0}));
}

TEST_F(AudioInSink, SmallerIsMeantSigned) {
  append(sink_->audio_list, short_audio_desc_t{2, 6, 7, 0, 0xFFFFFFFF, 5, 5});
  short_audio_desc_t audio{2, 6, 7, 0, 100, 0x80000000, 5};
  EXPECT_EQ(in_sink(audio), 1U);
  EXPECT_EQ(words_of(audio), (test_support::audio_words_t{2, 6, 7, 0, 0xFFFFFFFF, 0x80000000, 5}));
}

TEST_F(AudioInSink, TakesTheFirstEntryThatMatches) {
  append(sink_->audio_list, of_type(2, 0x40));
  append(sink_->audio_list, short_audio_desc_t{2, 2, 0x03, 0, 0, 0, 0});
  append(sink_->audio_list, short_audio_desc_t{2, 8, 0x07, 0, 0, 0, 0});
  short_audio_desc_t audio = of_type(2, 0x06);
  EXPECT_EQ(in_sink(audio), 1U);
  EXPECT_EQ(words_of(audio), (test_support::audio_words_t{2, 2, 0x02, 0, 0, 0, 0}));
}

TEST_F(AudioInSink, PcmIsNarrowedInRatesAndSampleSizes) {
  append(sink_->audio_list, pcm(2, 0x07, 0x3));
  short_audio_desc_t audio = pcm(2, 0x14, 0x5);
  EXPECT_EQ(in_sink(audio), 1U);
  EXPECT_EQ(words_of(audio), words_of(pcm(2, 0x04, 0x1)));
}

TEST_F(AudioInSink, PcmWithoutACommonSampleSizeIsRefusedUnchanged) {
  append(sink_->audio_list, pcm(2, 7, 0x2));
  short_audio_desc_t audio = pcm(2, 3, 0x5);
  EXPECT_EQ(in_sink(audio), 0U);
  EXPECT_EQ(words_of(audio), words_of(pcm(2, 3, 0x5)));
}

TEST_F(AudioInSink, StereoAndMultichannelPcmNeverMatch) {
  append(sink_->audio_list, pcm(2));
  EXPECT_EQ(in_sink(pcm(2)), 1U);
  for (const u32 channels : {1U, 3U, 8U})
    EXPECT_EQ(in_sink(pcm(channels)), 0U) << channels;

  test_support::scoped_edid_t multichannel;
  append(multichannel->audio_list, pcm(6));
  short_audio_desc_t audio = pcm(8);
  EXPECT_EQ(_audio_format_in_downstream_sink(multichannel.get(), &audio), 1U);
  EXPECT_EQ(audio.channels, 6U);
  for (const u32 channels : {1U, 2U}) {
    audio = pcm(channels);
    EXPECT_EQ(_audio_format_in_downstream_sink(multichannel.get(), &audio), 0U) << channels;
  }
}

TEST_F(AudioInSink, MonoPcmMatchesNothing) {
  append(sink_->audio_list, pcm(1));
  EXPECT_EQ(in_sink(pcm(1)), 0U);
}

TEST_F(AudioInSink, SampleSizesOfOtherTypesAreNotCompared) {
  append(sink_->audio_list, short_audio_desc_t{2, 2, 7, 0x2, 0, 0, 0});
  short_audio_desc_t audio{2, 6, 7, 0x5, 0, 0, 0};
  EXPECT_EQ(in_sink(audio), 1U);
  EXPECT_EQ(audio.pcm_bits, 0x5U);
  EXPECT_EQ(audio.channels, 2U);
}

class AudioListMask : public AudioList {
 protected:
  std::vector<u32> types_after(u32 mask) {
    EXPECT_EQ(output_of([&] { _filter_audio_list_with_mask(list_.get(), mask); }), "");
    std::vector<u32> types;
    for (const auto &audio : test_support::elements_of<short_audio_desc_t>(*list_))
      types.push_back(audio.type);
    return types;
  }
};

TEST_F(AudioListMask, RemovesTheTypesItLacksButNeverTheFirstEntry) {
  for (const u32 type : {2U, 1U, 7U})
    append(*list_, of_type(type));
  EXPECT_EQ(types_after(0x1), (std::vector<u32>{2, 1}));
}

TEST_F(AudioListMask, OfNothingLeavesTheFirstEntry) {
  for (const u32 type : {7U, 1U, 7U, 18U})
    append(*list_, of_type(type));
  EXPECT_EQ(types_after(0), (std::vector<u32>{7}));
}

TEST_F(AudioListMask, OfEverythingRemovesTypesWithoutBit) {
  for (const u32 type : {0U, 15U, 16U, 0U, 19U, 18U, 14U})
    append(*list_, of_type(type));
  EXPECT_EQ(types_after(0xFFFFFFFF), (std::vector<u32>{0, 16, 18, 14}));
}

TEST_F(AudioListMask, LeavesAnEmptyListEmpty) {
  EXPECT_EQ(types_after(0), std::vector<u32>{});
}

TEST_F(AudioListMask, IsTracedBackwardsWithoutTheFirstEntry) {
  append(*list_, of_type(2));
  append(*list_, pcm(2));
  append(*list_, of_type(16, 0));
  const auto line = [](const char *message) { return trace("_filter_audio_list_with_mask", message); };
  EXPECT_EQ(test_support::traced_output_of([&] { _filter_audio_list_with_mask(list_.get(), 0x1); }),
            line("\tMask:0x00000001") + line("_filter_audio_list_with_mask() - Printing reverse formats\n") +
                line("\t\tFormat:") + "Code: 16:HE AAC Channels:6 Freq: NoFreqSpecified\n" + line("\t\tFormat:") +
                "Code: 1:PCM Channels:2 Freq:32kHz 44.1kHz 48kHz  Bits:16bits 24bits \n");
}

}  // namespace

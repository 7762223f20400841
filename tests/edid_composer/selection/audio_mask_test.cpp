// Masks of audio types.
#include "edid_composer/selection/audio_mask.h"

#include <vector>

#include "edid_composer/composer_lines.h"
#include "edid_composer/stage_fixture.h"

namespace {

using composer_lines::trace;
using edid_composer::_audio_type_to_audio_mask;
using edid_composer::_create_audio_mask;
using edid_composer::_filter_audio_list_with_mask;
using test_support::output_of;

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

class AudioListMask : public composer_fixtures::Stage {
 protected:
  std::vector<u32> types_after(u32 mask) {
    EXPECT_EQ(output_of([&] { _filter_audio_list_with_mask(list_.get(), mask, &arena_, &journal_); }), "");
    std::vector<u32> types;
    for (const auto &audio : test_support::elements_of<short_audio_desc_t>(*list_))
      types.push_back(audio.type);
    return types;
  }

  composer_fixtures::arena_list_t<short_audio_desc_t> list_{&arena_};
};

TEST_F(AudioListMask, IsThatOfAllItsTypes) {
  EXPECT_EQ(_create_audio_mask(list_.get()), 0U);
  for (const u32 type : {1U, 1U, 7U, 18U, 0U, 15U, 40U})
    list_.append(of_type(type));
  EXPECT_EQ(_create_audio_mask(list_.get()), 0x10041U);
}

TEST_F(AudioListMask, RemovesTheTypesItLacksButNeverTheFirstEntry) {
  for (const u32 type : {2U, 1U, 7U})
    list_.append(of_type(type));
  EXPECT_EQ(types_after(0x1), (std::vector<u32>{2, 1}));
}

TEST_F(AudioListMask, OfNothingLeavesTheFirstEntry) {
  for (const u32 type : {7U, 1U, 7U, 18U})
    list_.append(of_type(type));
  EXPECT_EQ(types_after(0), (std::vector<u32>{7}));
}

TEST_F(AudioListMask, OfEverythingRemovesTypesWithoutBit) {
  for (const u32 type : {0U, 15U, 16U, 0U, 19U, 18U, 14U})
    list_.append(of_type(type));
  EXPECT_EQ(types_after(0xFFFFFFFF), (std::vector<u32>{0, 16, 18, 14}));
}

TEST_F(AudioListMask, LeavesAnEmptyListEmpty) {
  EXPECT_EQ(types_after(0), std::vector<u32>{});
}

TEST_F(AudioListMask, IsTracedBackwardsWithoutTheFirstEntry) {
  list_.append(of_type(2));
  list_.append({1, 2, 7, 5, 0, 0, 0});
  list_.append(of_type(16, 0));
  const auto line = [](const char *message) { return trace("_filter_audio_list_with_mask", message); };
  EXPECT_EQ(test_support::traced_output_of([&] { _filter_audio_list_with_mask(list_.get(), 0x1, &arena_, &journal_); }),
            line("\tMask:0x00000001") + line("_filter_audio_list_with_mask() - Printing reverse formats\n") +
                line("\t\tFormat:") + "Code: 16:HE AAC Channels:6 Freq: NoFreqSpecified\n" + line("\t\tFormat:") +
                "Code: 1:PCM Channels:2 Freq:32kHz 44.1kHz 48kHz  Bits:16bits 24bits \n");
}

}  // namespace

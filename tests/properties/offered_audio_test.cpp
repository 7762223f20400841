// Which audio formats a composed EDID offers.
#include <algorithm>

#include "composing_fixture.h"

namespace properties {
namespace {

using descriptor_t = std::array<u8, 3>;

constexpr descriptor_t added_basic_audio{0x09, 0x07, 0x05};

bool is_basic_audio(const descriptor_t &descriptor) {
  return audio_type_of(descriptor) == 1 && (descriptor[0] & 7) == 1 && (descriptor[1] & 7) != 0;
}

/// What the caller allows, and with the filter on the sink has too.
u32 mask_of(const situation_t &situation) {
  u32 mask = situation.settings.audio_mask;
  if (situation.settings.audio_sink_filter != 1) return mask;
  u32 of_sink = 0;
  for (const u32 type : situation.sink.audio_types)
    of_sink |= mask_bit_of(type);
  return mask & of_sink;
}

TEST(RandomComposition, OffersNoAudioTypeOutsideOfTheMaskButTheFirstAndBasicAudio) {
  u32 formats = 0;
  for_each_run(2500, [&](random_source_t &random) {
    const situation_t situation = random_situation(random);
    const printed_composition_t composition = compose(situation);
    if (!composition.result) return;
    const composed_edid_t edid = taken_apart(composition.bytes, composition.spa_offset);
    ASSERT_FALSE(edid.audio.empty());
    const u32 mask = mask_of(situation);
    // Where basic audio had to be added, it stands before the first.
    const std::size_t first_examined = edid.audio.front() == added_basic_audio ? 2 : 1;
    for (std::size_t i = first_examined; i < edid.audio.size(); ++i) {
      ++formats;
      EXPECT_NE(mask_bit_of(audio_type_of(edid.audio[i])) & mask, 0u) << i;
    }
  });
  expect_at_least(1000, formats, "audio formats");
}

TEST(RandomComposition, AlwaysOffersBasicAudio) {
  for_each_run(2500, [](random_source_t &random) {
    const situation_t situation = random_situation(random);
    const printed_composition_t composition = compose(situation);
    if (!composition.result) return;
    const composed_edid_t edid = taken_apart(composition.bytes, composition.spa_offset);
    // What stands after the tenth is left out, and may have been it.
    if (edid.audio.size() < 10) {
      EXPECT_TRUE(std::any_of(edid.audio.begin(), edid.audio.end(), is_basic_audio));
    }
  });
}

TEST(RandomComposition, OffersOnlyAudioTypesThatThePassThroughModeAllows) {
  for_each_run(2500, [](random_source_t &random) {
    const situation_t situation = random_situation(random);
    const printed_composition_t composition = compose(situation);
    if (!composition.result) return;
    std::vector<u32> allowed{1};
    if (situation.platform.audio_pass_through < 2) {
      for (const i32 entry : situation.platform.audio) {
        const auto packed = static_cast<u32>(entry);
        allowed.push_back(audio_type_of({static_cast<u8>(packed & 0xFF), 0, static_cast<u8>(packed >> 16)}));
      }
    }
    if (situation.platform.audio_pass_through > 0) {
      allowed.insert(allowed.end(), situation.sink.audio_types.begin(), situation.sink.audio_types.end());
    }
    for (const auto &descriptor : taken_apart(composition.bytes, composition.spa_offset).audio) {
      EXPECT_EQ(std::count(allowed.begin(), allowed.end(), audio_type_of(descriptor)) > 0, true)
          << audio_type_of(descriptor);
    }
  });
}

}  // namespace
}  // namespace properties

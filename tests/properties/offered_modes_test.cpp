// Which video modes a composed EDID offers.
#include "offered_modes.h"

#include <algorithm>

#include "composing_fixture.h"

namespace properties {
namespace {

using test_support::mode_pair_t;

std::vector<u32> first_vics(const std::vector<mode_pair_t> &modes, std::size_t most) {
  std::vector<u32> vics;
  for (std::size_t i = 0; i < std::min(most, modes.size()); ++i)
    vics.push_back(modes[i].first);
  return vics;
}

/// The bit of a 3D_Structure (HDMI 1.4a, appendix H) in a mode's mask.
u32 stereo_of(u32 structure) {
  constexpr u32 masks[] = {0x01, 0x08, 0x10, 0x20, 0x40, 0x80, 0x04, 0, 0x02};
  return structure <= 8 ? masks[structure] : 0;
}

TEST(RandomComposition, OffersTheModesThatPlatformAndSinkAgreeOnAndNoOther) {
  u32 composed = 0;
  for_each_run(2500, [&](random_source_t &random) {
    const situation_t situation = random_situation(random);
    const printed_composition_t composition = compose(situation);
    if (failed_for_unknown_audio(composition)) return;
    ASSERT_TRUE(composition.result) << composition.output;
    ++composed;
    const composed_edid_t edid = taken_apart(composition.bytes, composition.spa_offset);
    const std::vector<mode_pair_t> modes = modes_to_offer(situation);
    EXPECT_EQ(edid.vics, first_vics(modes, 32));
    EXPECT_EQ(edid.hdmi_vics, hdmi_vics_to_offer(situation));
    for (std::size_t i = 0; i < 2; ++i) {
      const auto timing = composition.bytes.begin() + 54 + 18 * static_cast<std::ptrdiff_t>(i);
      EXPECT_EQ(test_support::bytes_t(timing, timing + 18),
                test_support::timing_descriptor(test_support::timing_of_vic(modes[i].first)));
    }
  });
  expect_at_least(2000, composed, "compositions");
}

TEST(RandomComposition, OffersOnlyThe3dStructuresThatPlatformAndSinkAgreeOn) {
  u32 structures = 0;
  for_each_run(2500, [&](random_source_t &random) {
    const situation_t situation = random_situation(random);
    const printed_composition_t composition = compose(situation);
    if (!composition.result) return;
    const composed_edid_t edid = taken_apart(composition.bytes, composition.spa_offset);
    const i32 mode = situation.settings.hdmi_3d_mode;
    EXPECT_EQ(edid.has_3d, mode == 2 || (mode == 1 && situation.sink.has_3d));
    EXPECT_TRUE(edid.has_3d || edid.structures.empty());
    const std::vector<mode_pair_t> modes = modes_to_offer(situation);
    for (const auto &[index, structure] : edid.structures) {
      ++structures;
      ASSERT_LT(index, modes.size());
      EXPECT_NE(modes[index].second & stereo_of(structure), 0u) << index << " " << structure;
    }
  });
  expect_at_least(200, structures, "3D structures");
}

TEST(RandomComposition, OfAnySinkOffersNoModeThatThePlatformDoesNotName) {
  for_each_run(2500, [](random_source_t &random) {
    situation_t situation = random_situation(random);
    situation.sink = {};
    situation.sink.bytes = random_bytes_of_a_sink(random);
    const printed_composition_t composition = compose(situation);
    if (failed_for_unknown_audio(composition)) return;
    ASSERT_TRUE(composition.result) << composition.output;
    const composed_edid_t edid = taken_apart(composition.bytes, composition.spa_offset);
    const auto &platform = situation.platform;
    u32 current = 0;
    static_cast<void>(mode_to_vic(&situation.settings.hdmi_current_mode, &current));
    const auto named_by = [&](const std::vector<mode_pair_t> &priority) {
      return std::all_of(edid.vics.begin(), edid.vics.end(), [&](u32 vic) {
        const bool named = std::any_of(priority.begin(), priority.end(), [vic](auto &m) { return m.first == vic; });
        return named || vic == 1 || (vic == current && platform.current_mode_set_to_priority != 0);
      });
    };
    EXPECT_TRUE(named_by(platform.video_60_priority) || named_by(platform.video_50_priority));
  });
}

}  // namespace
}  // namespace properties

// The limit of the frame height: how tall the sink's modes are, and which candidates it takes out.
#include "edid_composer/selection/geometry_limit.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "edid_composer/composer_lines.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using composer_lines::bug;
using composer_lines::error;
using composer_lines::trace;
using edid_composer::_find_largest_height;
using edid_composer::_remove_larger_height_modes;
using test_support::append_modes;
using test_support::output_of;
using test_support::traced_output_of;

using vics_t = std::vector<u32>;

std::string unknown_vic(const std::string &vic) {
  return test_support::warning_line(
      "utility", "convert_vic_to_dtd",
      "Invalid vic requested for conversion to a DTD. Requested VIC:" + vic + " Range:0-64");
}

class GeometryLimit : public testing::Test {
 protected:
  void candidates(const vics_t &vics) {
    for (const u32 vic : vics)
      EXPECT_TRUE(candidates_.add({vic, 0, false}, {"edid_composer", "_reporter"}));
  }
  /// The candidates that a limit leaves, of those that the last one has left.
  vics_t left_by(u32 limit) {
    _remove_larger_height_modes(limit, &candidates_, &journal_);
    vics_t vics;
    candidates_.for_each([&](const edid_composer::candidate_t &candidate) { vics.push_back(candidate.vic); });
    return vics;
  }

  test_support::scoped_list_t<short_video_desc_t> list_;
  edid_composer::entry_arena_t arena_;
  edid_composer::candidates_t candidates_{true, &arena_};
  edid_composer::journal_t journal_{false, &arena_};
};

TEST_F(GeometryLimit, TallestModeIsThatOfTheFrame) {
  append_modes(*list_, {{1, 0}, {5, 0}, {4, 0}});
  EXPECT_EQ(traced_output_of([&] { EXPECT_EQ(_find_largest_height(list_.get()), 1080U); }),
            trace("_find_largest_height", "Largest Height:1080\n"));
}

TEST_F(GeometryLimit, TallestModeOfEachVicDoublesTheLinesOfAField) {
  for (u32 vic = 1; vic <= 64; ++vic) {
    test_support::scoped_list_t<short_video_desc_t> list;
    append_modes(*list, {{vic, 0}});
    detailed_timing_t timing{};
    ASSERT_EQ(convert_vic_to_dtd(vic, &timing), 1);
    EXPECT_EQ(_find_largest_height(list.get()), timing.progressive == 1 ? timing.v_active : timing.v_active * 2) << vic;
  }
}

TEST_F(GeometryLimit, TallestModeOfNoModesIsZero) {
  EXPECT_EQ(output_of([&] { EXPECT_EQ(_find_largest_height(list_.get()), 0U); }), "");
}

TEST_F(GeometryLimit, TallestModeSkipsUnknownVics) {
  append_modes(*list_, {{65, 0}, {2, 0}, {0, 0}});
  EXPECT_EQ(output_of([&] { EXPECT_EQ(_find_largest_height(list_.get()), 480U); }),
            unknown_vic("65") + bug("_find_largest_height", "\tFailed converting VIC:65 to a DTD.") + unknown_vic("0") +
                bug("_find_largest_height", "\tFailed converting VIC:0 to a DTD."));
}

TEST_F(GeometryLimit, TallestModeOfAListOfAnotherTypeIsReported) {
  test_support::scoped_list_t<i32> numbers;
  EXPECT_EQ(output_of([&] { EXPECT_EQ(_find_largest_height(numbers.get()), 0U); }),
            error("_find_largest_height", "The list types don't match."));
}

TEST_F(GeometryLimit, TakesOutWhatIsTallerAndLeavesWhatIsEqual) {
  candidates({16, 4, 5, 1, 17, 16});
  EXPECT_EQ(output_of([&] {
              EXPECT_EQ(left_by(0xFFFFFFFF).size(), 6U);
              EXPECT_EQ(left_by(720), (vics_t{4, 1, 17}));
              EXPECT_EQ(left_by(575), vics_t{1});
              EXPECT_EQ(left_by(0), vics_t{});
            }),
            "");
}

TEST_F(GeometryLimit, LeavesUnknownVicsAndGoesThroughTheCandidatesBackwards) {
  candidates({65, 16, 0});
  EXPECT_EQ(output_of([&] {
              EXPECT_EQ(left_by(0), (vics_t{65, 0}));
            }),
            unknown_vic("0") + bug("_remove_larger_height_modes", "\tFailed converting VIC:0 to a DTD.") +
                unknown_vic("65") + bug("_remove_larger_height_modes", "\tFailed converting VIC:65 to a DTD."));
}

}  // namespace

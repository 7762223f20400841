// The modes that a new EDID may offer: gathered from lists, and matched with what is asked for.
#include "edid_composer/selection/candidates.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdio>
#include <string>
#include <vector>

#include "edid_composer/composer_lines.h"
#include "edid_composer/selection/video_modes.h"
#include "support/failing_allocation.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using composer_lines::error;
using composer_lines::trace;
using edid_composer::_combine_lists;
using edid_composer::candidate_t;
using edid_composer::candidates_t;
using edid_composer::match_t;
using edid_composer::site_t;
using test_support::append;
using test_support::append_modes;
using test_support::output_of;
using test_support::traced_output_of;

using modes_t = std::vector<test_support::mode_pair_t>;

constexpr site_t reporter{"edid_composer", "_reporter"};

class Candidates : public testing::Test {
 protected:
  void add(const candidate_t &candidate) { EXPECT_TRUE(candidates_.add(candidate, reporter)); }
  bool combine(bool of_sink = false) { return _combine_lists(&candidates_, extra_.get(), of_sink); }
  modes_t modes() const {
    modes_t modes;
    candidates_.for_each([&](const candidate_t &candidate) { modes.emplace_back(candidate.vic, candidate.stereo); });
    EXPECT_EQ(modes.size(), candidates_.size());
    return modes;
  }

  edid_composer::entry_arena_t arena_;
  candidates_t candidates_{true, &arena_};
  test_support::scoped_list_t<short_video_desc_t> extra_;
};

TEST_F(Candidates, MatchByTheirVicAndAddUpTheirSharedStructures) {
  add({16, 0x1, false});
  add({4, 0xFF, true});
  add({16, 0x46, false});
  const match_t match = candidates_.match({.native = 0, .vic = 16, .stereo = 0x45});
  EXPECT_TRUE(match.found);
  EXPECT_FALSE(match.of_sink);
  EXPECT_EQ(match.stereo, 0x45U);
  EXPECT_FALSE(candidates_.match({.native = 0, .vic = 5, .stereo = 0xFF}).found);
}

TEST_F(Candidates, AreTheSinksWhenOneOfThemIs) {
  add({16, 0, false});
  add({16, 0, true});
  add({16, 0, false});
  EXPECT_TRUE(candidates_.match({.native = 0, .vic = 16, .stereo = 0}).of_sink);
}

TEST_F(Candidates, MatchTheSameWhetherTheyAreKeptInOrderOrNot) {
  candidates_t unordered(false, &arena_);
  for (u32 i = 0; i < 400; ++i) {
    // VICs on both sides of the largest that a short video descriptor can hold.
    const candidate_t candidate{100 + i * 7 % 50, 1U << i % 8, i % 5 == 0};
    add(candidate);
    EXPECT_TRUE(unordered.add(candidate, reporter));
  }
  EXPECT_EQ(unordered.size(), 400U);
  for (u32 vic = 95; vic < 155; ++vic) {
    const short_video_desc_t wanted{.native = 0, .vic = vic, .stereo = 0x5A};
    const match_t match = candidates_.match(wanted);
    EXPECT_EQ(match.found, vic >= 100 && vic < 150) << vic;
    EXPECT_EQ(unordered.match(wanted).found, match.found) << vic;
    EXPECT_EQ(unordered.match(wanted).of_sink, match.of_sink) << vic;
    EXPECT_EQ(unordered.match(wanted).stereo, match.stereo) << vic;
  }
}

TEST_F(Candidates, ThatAreRemovedMatchNothingAndDoNotCount) {
  for (u32 vic = 1; vic <= 4; ++vic)
    add({vic, 1, true});
  std::vector<u32> asked;
  candidates_.remove_if([&](u32 vic) {
    asked.push_back(vic);
    return vic % 2 == 0;
  });
  EXPECT_EQ(asked, (std::vector<u32>{4, 3, 2, 1}));
  EXPECT_EQ(modes(), (modes_t{{1, 1}, {3, 1}}));
  EXPECT_FALSE(candidates_.match({.native = 0, .vic = 2, .stereo = 1}).found);

  asked.clear();
  candidates_.remove_if([&](u32 vic) {
    asked.push_back(vic);
    return true;
  });
  EXPECT_EQ(asked, (std::vector<u32>{3, 1}));
  EXPECT_EQ(modes(), modes_t{});
}

TEST_F(Candidates, OfAListFollowTheOthersInItsOrder) {
  add({16, 1, false});
  append(*extra_, short_video_desc_t{1, 4, 5});
  append(*extra_, short_video_desc_t{0, 16, 0x80});
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(combine(true)); }), "");
  EXPECT_EQ(modes(), (modes_t{{16, 1}, {4, 5}, {16, 0x80}}));
  EXPECT_TRUE(candidates_.match({.native = 0, .vic = 4, .stereo = 0}).of_sink);
  EXPECT_EQ(ll_size(extra_.get()), 2);
}

TEST_F(Candidates, OfAListAreTraced) {
  add({39, 2, false});
  append_modes(*extra_, {{4, 0xFF}, {100, 0x1000}});
  EXPECT_EQ(traced_output_of([&] { EXPECT_TRUE(combine()); }),
            trace("_combine_lists", "Combine Lists:") +
                trace("_combine_lists", "\tAdding video format:4 1280x720p60Hz16x9 stereo:0x0FF") +
                trace("_combine_lists", "\tAdding video format:100 Unknown Value stereo:0x1000") +
                trace("_combine_lists", "\tList after combining:") +
                "\t\tVIC:39 1920x10801250i50Hz16x9 SSH  \n"
                "\t\tVIC:4 1280x720p60Hz16x9 FP SSH TBH FA LA SSF LD LD+G  \n"
                "\t\tVIC:100 Unknown Value  \n");
}

TEST_F(Candidates, OfAListThatWasNeverInitialisedAreReportedByTheirOwnAddress) {
  const ll_list_t nothing{};
  char expected[96];
  std::snprintf(expected, sizeof expected, "() ERROR: extra_list has not been initialized. ptr=%p\n",
                static_cast<void *>(&candidates_));
  const std::string output =
      test_support::raw_output_of([&] { EXPECT_FALSE(_combine_lists(&candidates_, &nothing, false)); });
  EXPECT_NE(output.find(std::string(":_combine_lists") + expected), std::string::npos) << output;
}

TEST_F(Candidates, StopAtTheFirstOneThatThereIsNoMemoryFor) {
  modes_t many;
  for (u32 i = 0; i < 200; ++i)
    many.emplace_back(i, 0);
  append_modes(*extra_, many);
  EXPECT_EQ(output_of([&] {
              const test_support::failing_allocation_t failing(3);
              EXPECT_FALSE(combine());
            }),
            test_support::bug_line("linked_list", "ll_create_entry",
                                   "calloc failed to allocate memory for the entry. ptr:PTR") +
                error("_combine_lists", "Failed creating entry."));
  const modes_t kept = modes();
  EXPECT_FALSE(kept.empty());
  EXPECT_LT(kept.size(), many.size());
  EXPECT_TRUE(std::equal(kept.begin(), kept.end(), many.begin()));
}

}  // namespace

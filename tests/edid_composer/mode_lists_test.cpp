// The steps of the mode selection that work on one list: combining, and the limit of the frame height.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "composer_lines.h"
#include "edid_composer/video_modes.h"
#include "support/failing_allocation.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using composer_lines::bug;
using composer_lines::error;
using composer_lines::trace;
using composer_lines::warning;
using edid_composer::_combine_lists;
using edid_composer::_find_largest_height;
using edid_composer::_remove_larger_height_modes;
using test_support::append;
using test_support::append_modes;
using test_support::output_of;
using test_support::traced_output_of;

using modes_t = std::vector<test_support::mode_pair_t>;

std::string unknown_vic(const std::string &vic) {
  return test_support::warning_line(
      "utility", "convert_vic_to_dtd",
      "Invalid vic requested for conversion to a DTD. Requested VIC:" + vic + " Range:0-64");
}

class ModeLists : public testing::Test {
 protected:
  test_support::scoped_list_t<short_video_desc_t> list_;
  test_support::scoped_list_t<short_video_desc_t> extra_;
};

TEST_F(ModeLists, CombiningAppendsCopiesWithoutTheNativeFlag) {
  append_modes(*list_, {{16, 1}});
  append(*extra_, short_video_desc_t{1, 4, 5});
  append(*extra_, short_video_desc_t{0, 16, 0x80});
  EXPECT_EQ(output_of([&] { EXPECT_EQ(_combine_lists(list_.get(), extra_.get()), 1U); }), "");
  EXPECT_EQ(test_support::modes_of(*list_), (modes_t{{16, 1}, {4, 5}, {16, 0x80}}));
  EXPECT_EQ(test_support::elements_of<short_video_desc_t>(*list_).at(1).native, 0);
  EXPECT_EQ(ll_size(extra_.get()), 2);
}

TEST_F(ModeLists, CombiningIsTraced) {
  append(*list_, short_video_desc_t{1, 39, 2});
  append_modes(*extra_, {{4, 0xFF}, {100, 0x1000}});
  EXPECT_EQ(traced_output_of([&] { EXPECT_EQ(_combine_lists(list_.get(), extra_.get()), 1U); }),
            trace("_combine_lists", "Combine Lists:") +
                trace("_combine_lists", "\tAdding video format:4 1280x720p60Hz16x9 stereo:0x0FF") +
                trace("_combine_lists", "\tAdding video format:100 Unknown Value stereo:0x1000") +
                trace("_combine_lists", "\tList after combining:") +
                "\t\tVIC:39 1920x10801250i50Hz16x9 SSH  Native\n"
                "\t\tVIC:4 1280x720p60Hz16x9 FP SSH TBH FA LA SSF LD LD+G  \n"
                "\t\tVIC:100 Unknown Value  \n");
}

TEST_F(ModeLists, CombiningChecksTheDestinationFirstAndAlwaysPrintsItsAddress) {
  ll_list_t nothing{};
  const auto combine = [](ll_list_t *list, const ll_list_t *extra) {
    return output_of([&] { EXPECT_EQ(_combine_lists(list, extra), 0U); });
  };
  EXPECT_EQ(combine(nullptr, nullptr), error("_combine_lists", "vic_list is NULL. ptr=(nil)"));
  EXPECT_EQ(combine(&nothing, nullptr), error("_combine_lists", "vic_list has not been initialized. ptr=PTR"));
  EXPECT_EQ(combine(list_.get(), nullptr), warning("_combine_lists", "extra_list is NULL. ptr=PTR"));
  EXPECT_EQ(combine(list_.get(), &nothing), error("_combine_lists", "extra_list has not been initialized. ptr=PTR"));
}

TEST_F(ModeLists, CombiningPrintsTheDestinationAlsoForTheSource) {
  // Two addresses of which one is known: the text holds the destination's.
  ll_list_t nothing{};
  char expected[64];
  std::snprintf(expected, sizeof expected, "extra_list has not been initialized. ptr=%p\n",
                static_cast<void *>(list_.get()));
  EXPECT_NE(test_support::raw_output_of([&] { _combine_lists(list_.get(), &nothing); }).find(expected),
            std::string::npos);
}

TEST_F(ModeLists, CombiningStopsAtTheFirstEntryThatCannotBeMade) {
  append_modes(*extra_, {{4, 0}, {16, 0}});
  EXPECT_EQ(output_of([&] {
              const test_support::failing_allocation_t failing(3);
              EXPECT_EQ(_combine_lists(list_.get(), extra_.get()), 0U);
            }),
            test_support::bug_line("linked_list", "ll_create_entry",
                                   "calloc failed to allocate memory for the entry. ptr:PTR") +
                error("_combine_lists", "Failed creating entry."));
  EXPECT_EQ(test_support::modes_of(*list_), (modes_t{{4, 0}}));
}

TEST_F(ModeLists, CombiningIntoAListOfAnotherTypeFails) {
  test_support::scoped_list_t<i32> numbers;
  append_modes(*extra_, {{4, 0}});
  const std::string output = output_of([&] { EXPECT_EQ(_combine_lists(numbers.get(), extra_.get()), 0U); });
  EXPECT_EQ(test_support::count_of(output, "\n"), 2) << output;
  EXPECT_NE(output.find("ll_add_entry_to_back() BUG: This entry represents a different type"), std::string::npos);
  EXPECT_NE(output.find(error("_combine_lists", "Failed adding entry to the back of the list.")), std::string::npos);
  EXPECT_EQ(ll_size(numbers.get()), 0);
}

TEST_F(ModeLists, LargestHeightIsThatOfTheFrame) {
  append_modes(*list_, {{1, 0}, {5, 0}, {4, 0}});
  EXPECT_EQ(traced_output_of([&] { EXPECT_EQ(_find_largest_height(list_.get()), 1080U); }),
            trace("_find_largest_height", "Largest Height:1080\n"));
}

TEST_F(ModeLists, LargestHeightOfEachVicDoublesTheLinesOfAField) {
  for (u32 vic = 1; vic <= 64; ++vic) {
    test_support::scoped_list_t<short_video_desc_t> list;
    append_modes(*list, {{vic, 0}});
    detailed_timing_t timing{};
    ASSERT_EQ(convert_vic_to_dtd(vic, &timing), 1);
    EXPECT_EQ(_find_largest_height(list.get()), timing.progressive == 1 ? timing.v_active : timing.v_active * 2) << vic;
  }
}

TEST_F(ModeLists, LargestHeightOfNoModesIsZero) {
  EXPECT_EQ(output_of([&] { EXPECT_EQ(_find_largest_height(list_.get()), 0U); }), "");
}

TEST_F(ModeLists, LargestHeightSkipsUnknownVics) {
  append_modes(*list_, {{65, 0}, {2, 0}, {0, 0}});
  EXPECT_EQ(output_of([&] { EXPECT_EQ(_find_largest_height(list_.get()), 480U); }),
            unknown_vic("65") + bug("_find_largest_height", "\tFailed converting VIC:65 to a DTD.") + unknown_vic("0") +
                bug("_find_largest_height", "\tFailed converting VIC:0 to a DTD."));
}

TEST_F(ModeLists, LargestHeightOfAMissingListIsReported) {
  EXPECT_EQ(output_of([&] { EXPECT_EQ(_find_largest_height(nullptr), 0U); }),
            test_support::error_line("linked_list", "ll_verify_list_type", "list ptr is NULL.") +
                error("_find_largest_height", "The list types don't match.") +
                bug("_find_largest_height", "The list:video_list of type:short_video_desc_t is NULL."));
}

TEST_F(ModeLists, LargestHeightOfAListOfAnotherTypeIsReported) {
  test_support::scoped_list_t<i32> numbers;
  EXPECT_EQ(output_of([&] { EXPECT_EQ(_find_largest_height(numbers.get()), 0U); }),
            error("_find_largest_height", "The list types don't match."));
}

TEST_F(ModeLists, LargerModesAreRemovedAndEqualOnesStay) {
  append_modes(*list_, {{16, 0}, {4, 0}, {5, 0}, {1, 0}, {17, 0}, {16, 1}});
  EXPECT_EQ(output_of([&] { _remove_larger_height_modes(720, list_.get()); }), "");
  EXPECT_EQ(test_support::modes_of(*list_), (modes_t{{4, 0}, {1, 0}, {17, 0}}));
  _remove_larger_height_modes(575, list_.get());
  EXPECT_EQ(test_support::modes_of(*list_), (modes_t{{1, 0}}));
  _remove_larger_height_modes(0, list_.get());
  EXPECT_EQ(ll_size(list_.get()), 0);
}

TEST_F(ModeLists, LimitIsUnsigned) {
  append_modes(*list_, {{16, 0}});
  _remove_larger_height_modes(0xFFFFFFFF, list_.get());
  EXPECT_EQ(ll_size(list_.get()), 1);
}

TEST_F(ModeLists, RemovalKeepsUnknownVicsAndGoesThroughTheListBackwards) {
  append_modes(*list_, {{65, 0}, {16, 0}, {0, 0}});
  EXPECT_EQ(output_of([&] { _remove_larger_height_modes(0, list_.get()); }),
            unknown_vic("0") + bug("_remove_larger_height_modes", "\tFailed converting VIC:0 to a DTD.") +
                unknown_vic("65") + bug("_remove_larger_height_modes", "\tFailed converting VIC:65 to a DTD."));
  EXPECT_EQ(test_support::modes_of(*list_), (modes_t{{65, 0}, {0, 0}}));
}

TEST_F(ModeLists, RemovalFromAnEmptyListDoesNothing) {
  EXPECT_EQ(output_of([&] { _remove_larger_height_modes(0, list_.get()); }), "");
}

}  // namespace

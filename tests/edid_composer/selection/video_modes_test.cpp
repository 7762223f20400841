// Which video modes a new EDID offers, and in which order.
#include "edid_composer/selection/video_modes.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "edid_composer/composer_lines.h"
#include "edid_composer/stage_fixture.h"
#include "support/edid_builder.h"
#include "support/failing_allocation.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using composer_lines::error;
using composer_lines::trace;
using edid_composer::_filter_video_modes;
using test_support::append;
using test_support::append_modes;
using test_support::output_of;
using test_support::timing_of_vic;
using test_support::traced_output_of;

using modes_t = std::vector<test_support::mode_pair_t>;

constexpr const char *filter = "_filter_video_modes";

const std::string no_memory =
    test_support::bug_line("linked_list", "ll_create_entry", "calloc failed to allocate memory for the entry. ptr:PTR");

class VideoModeFilter : public composer_fixtures::Stage {
 protected:
  bool run(ll_list_t *selected) { return _filter_video_modes(inputs(), selected, &journal_).complete; }
  bool run() { return run(selected_.get()); }

  /// The selection, by a run that prints nothing and succeeds.
  modes_t selection() {
    EXPECT_EQ(output_of([&] { EXPECT_TRUE(run()); }), "");
    return test_support::modes_of(*selected_);
  }

  composer_fixtures::arena_list_t<short_video_desc_t> selected_{&arena_};
};

TEST_F(VideoModeFilter, WithoutSinkOffersWhatPriorityAndAdditionListBothName) {
  append_modes(values_->video_60_priority, {{16, 0}, {4, 0}, {2, 0}});
  append_modes(values_->video_60_additional, {{2, 0}, {3, 0}, {16, 0}});
  append_modes(values_->video_50_priority, {{19, 0}});
  append_modes(values_->video_50_additional, {{19, 0}});
  EXPECT_EQ(selection(), (modes_t{{16, 0}, {2, 0}}));
}

TEST_F(VideoModeFilter, WithoutSinkTakesTheListsOfThePlatformsOwnRate) {
  values_->native_refresh_rate = 50;
  append_modes(values_->video_60_priority, {{16, 0}});
  append_modes(values_->video_60_additional, {{16, 0}});
  append_modes(values_->video_50_priority, {{31, 0}, {19, 0}});
  append_modes(values_->video_50_additional, {{19, 0}});
  EXPECT_EQ(selection(), (modes_t{{19, 0}}));
}

TEST_F(VideoModeFilter, SinkCountsWithDetailedTimingsAndShortDescriptors) {
  append(sink_->dtd_list, timing_of_vic(16));
  append(sink_->dtd_list, timing_of_vic(5));
  append_modes(sink_->video_list, {{4, 0}, {3, 0}});
  append_modes(values_->video_60_priority, {{1, 0}, {3, 0}, {4, 0}, {5, 0}, {16, 0}});
  EXPECT_EQ(selection(), (modes_t{{3, 0}, {4, 0}, {5, 0}, {16, 0}}));
}

TEST_F(VideoModeFilter, DetailedTimingWithoutImageSizeTakesTheShapeOfTheMonitor) {
  detailed_timing_t timing = timing_of_vic(3);
  timing.h_image_size = timing.v_image_size = 0;
  append(sink_->dtd_list, timing);
  sink_->h_size_cm = 160;
  sink_->v_size_cm = 120;
  append_modes(values_->video_60_priority, {{3, 0}, {2, 0}});
  EXPECT_EQ(selection(), (modes_t{{2, 0}}));
}

TEST_F(VideoModeFilter, StandardTimingsOfRealDisplaysMatchNoVic) {
  append(sink_->std_timings, std_timing_t{1920, 3, 60});
  append(sink_->std_timings, std_timing_t{640, 1, 60});
  append(sink_->std_timings, std_timing_t{1280, 3, 60});
  modes_t every_vic;
  for (u32 vic = 1; vic <= 64; ++vic)
    every_vic.emplace_back(vic, 0);
  append_modes(values_->video_60_priority, every_vic);
  EXPECT_EQ(selection(), modes_t{});
}

TEST_F(VideoModeFilter, UnknownDetailedTimingIsLeftOutInSilence) {
  detailed_timing_t timing = timing_of_vic(16);
  timing.pixel_clock = 148350000;
  append(sink_->dtd_list, timing);
  append_modes(values_->video_60_priority, {{16, 0}});
  EXPECT_EQ(selection(), modes_t{});
}

TEST_F(VideoModeFilter, ModeThatThePriorityListDoesNotNameIsDropped) {
  append_modes(sink_->video_list, {{16, 0}, {31, 0}, {4, 0}});
  append_modes(values_->video_60_additional, {{5, 0}});
  append_modes(values_->video_60_priority, {{4, 0}});
  EXPECT_EQ(selection(), (modes_t{{4, 0}}));
}

TEST_F(VideoModeFilter, ModeTwiceInThePriorityListStandsTwice) {
  append_modes(sink_->video_list, {{16, 5}, {4, 0}});
  append_modes(values_->video_60_priority, {{16, 1}, {4, 0}, {16, 4}});
  EXPECT_EQ(selection(), (modes_t{{16, 1}, {4, 0}, {16, 4}}));
}

TEST_F(VideoModeFilter, DuplicatesOfTheSinkCollapseAndAddTheir3dStructures) {
  append(sink_->dtd_list, timing_of_vic(16));
  append_modes(sink_->video_list, {{16, 0x1}, {16, 0x40}});
  append_modes(values_->video_60_additional, {{16, 0x4}});
  append_modes(values_->video_60_priority, {{16, 0x47}});
  EXPECT_EQ(selection(), (modes_t{{16, 0x45}}));
}

TEST_F(VideoModeFilter, Offers3dStructuresThatPriorityEntryAndSinkBothName) {
  append(sink_->dtd_list, timing_of_vic(16));
  append_modes(sink_->video_list, {{16, 0x5}, {4, 0x1}, {5, 0x2}});
  append_modes(values_->video_60_priority, {{16, 0x1}, {4, 0x4}, {5, 0xFF}});
  EXPECT_EQ(selection(), (modes_t{{16, 0x1}, {4, 0}, {5, 0x2}}));
}

TEST_F(VideoModeFilter, SelectionIsNeverNative) {
  append(sink_->video_list, short_video_desc_t{1, 16, 0});
  append(values_->video_60_priority, short_video_desc_t{1, 16, 0});
  selection();
  EXPECT_EQ(test_support::elements_of<short_video_desc_t>(*selected_).at(0).native, 0);
}

TEST_F(VideoModeFilter, IsAppendedToWhatTheListHolds) {
  selected_.append({0, 1, 0});
  append_modes(values_->video_60_priority, {{16, 0}});
  append_modes(values_->video_60_additional, {{16, 0}});
  EXPECT_EQ(selection(), (modes_t{{1, 0}, {16, 0}}));
}

TEST_F(VideoModeFilter, GeometryLimitDropsWhatIsTallerThanTheTallestShortDescriptor) {
  values_->geometry_limit = 1;
  append(sink_->dtd_list, timing_of_vic(16));  // A detailed timing does not raise the limit.
  append_modes(sink_->video_list, {{2, 0}, {4, 0}});
  append_modes(values_->video_60_additional, {{5, 0}, {1, 0}});
  append_modes(values_->video_60_priority, {{16, 0}, {5, 0}, {4, 0}, {2, 0}, {1, 0}});
  EXPECT_EQ(selection(), (modes_t{{4, 0}, {2, 0}, {1, 0}}));
}

TEST_F(VideoModeFilter, GeometryLimitCountsTheLinesOfTheFrame) {
  values_->geometry_limit = 1;
  append_modes(sink_->video_list, {{5, 0}});
  append_modes(values_->video_60_additional, {{16, 0}});
  append_modes(values_->video_60_priority, {{16, 0}, {5, 0}});
  EXPECT_EQ(selection(), (modes_t{{16, 0}, {5, 0}}));
}

TEST_F(VideoModeFilter, GeometryLimitWithoutShortDescriptorsDropsEverything) {
  values_->geometry_limit = 1;
  append(sink_->dtd_list, timing_of_vic(16));
  append_modes(values_->video_60_additional, {{1, 0}, {4, 0}});
  append_modes(values_->video_60_priority, {{16, 0}, {4, 0}, {1, 0}});
  EXPECT_EQ(selection(), modes_t{});
}

TEST_F(VideoModeFilter, IsTracedStepByStep) {
  append(sink_->dtd_list, timing_of_vic(16));
  append(sink_->std_timings, std_timing_t{1280, 2, 75});
  append(sink_->video_list, short_video_desc_t{1, 4, 5});
  append_modes(values_->video_60_additional, {{3, 0}});
  append(values_->video_60_priority, short_video_desc_t{1, 16, 1});
  append_modes(values_->video_60_priority, {{4, 4}, {2, 0}, {3, 7}});
  const std::string candidates = "\t\tVIC:16 1920x1080p60Hz16x9   \n\t\tVIC:4 1280x720p60Hz16x9 FP TBH  \n";
  EXPECT_EQ(traced_output_of([&] { EXPECT_TRUE(run()); }),
            trace("convert_std_to_vic",
                  "Aspect ratio of the standard timing is not a short video mode supported ratio. ratio:5:4") +
                trace("convert_std_to_vic",
                      "Unable to match Standard Timing. Hactive:1280 Aspect Ratio:5:4 Refresh Rate:75") +
                trace("_combine_lists", "Combine Lists:") +
                trace("_combine_lists", "\tAdding video format:4 1280x720p60Hz16x9 stereo:0x005") +
                trace("_combine_lists", "\tList after combining:") + candidates +
                trace("_determine_tv_native_refresh_rate",
                      "Found DTD number: index #0 had a 60 Hz refresh rate. Using 60Hz as native rate.") +
                trace(filter, "Combining 60Hz lists:") + trace("_combine_lists", "Combine Lists:") +
                trace("_combine_lists", "\tAdding video format:3 720x480p60Hz16x9 stereo:0x000") +
                trace("_combine_lists", "\tList after combining:") + candidates + "\t\tVIC:3 720x480p60Hz16x9   \n" +
                trace(filter, "\tPrioritization List:") +
                "\t\tVIC:16 1920x1080p60Hz16x9 FP  Native\n"
                "\t\tVIC:4 1280x720p60Hz16x9 TBH        \n"
                "\t\tVIC:2 720x480p60Hz4x3         \n"
                "\t\tVIC:3 720x480p60Hz16x9 FP SSH TBH        \n" +
                trace(filter, "Prioritize the list of valid modes and remove duplicates. Modes:3 MasterList:4") +
                trace(filter, "\tIgnoring hdmi_current_mode.") + trace(filter, "\tNew EDID List of VICs:") +
                "\t\tVIC:16 1920x1080p60Hz16x9         \n"
                "\t\tVIC:4 1280x720p60Hz16x9 TBH        \n"
                "\t\tVIC:3 720x480p60Hz16x9         \n");
}

TEST_F(VideoModeFilter, FiftyHertzIsTracedAsSuch) {
  values_->native_refresh_rate = 50;
  const std::string output = traced_output_of([&] { EXPECT_TRUE(run()); });
  EXPECT_NE(output.find(trace(filter, "Combining 50Hz lists:")), std::string::npos);
  EXPECT_EQ(output.find("Combining 60Hz lists:"), std::string::npos);
}

TEST_F(VideoModeFilter, ListOfAnotherTypeIsReportedByEachWalkAndGoneThrough) {
  for (ll_list_t *list : {&sink_->dtd_list, &sink_->std_timings}) {
    ASSERT_TRUE(ll_delete_list(list));
    ASSERT_TRUE(ll_init(list, "int"));
  }
  append_modes(sink_->video_list, {{16, 0}});
  append_modes(values_->video_60_priority, {{16, 0}});
  const std::string mismatch = "The list types don't match.";
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(run()); }), error(filter, mismatch) + error(filter, mismatch) +
                                                        error("_determine_tv_native_refresh_rate", mismatch) +
                                                        error("_determine_tv_native_refresh_rate", mismatch));
  EXPECT_EQ(test_support::modes_of(*selected_), (modes_t{{16, 0}}));
}

TEST_F(VideoModeFilter, ListThatWasNeverInitialisedFailsTheCombination) {
  const auto failure = [&](ll_list_t &list) {
    const ll_list_t kept = list;
    list.magic = 0;
    const std::string output = output_of([&] { EXPECT_FALSE(run()); });
    list = kept;
    return output;
  };
  const std::string uninitialised = error("_combine_lists", "extra_list has not been initialized. ptr=PTR");
  EXPECT_EQ(failure(sink_->video_list), uninitialised + error(filter, "Failed combining short video lists."));
  EXPECT_EQ(failure(values_->video_60_additional), uninitialised + error(filter, "Failed combining 60Hz lists."));
  values_->native_refresh_rate = 50;
  EXPECT_EQ(failure(values_->video_50_additional), uninitialised + error(filter, "Failed combining 50Hz lists."));
}

TEST_F(VideoModeFilter, OutputListOfAnotherTypeFailsTheFilter) {
  composer_fixtures::arena_list_t<std_timing_t> wrong(&arena_);
  append_modes(values_->video_60_priority, {{16, 0}});
  append_modes(values_->video_60_additional, {{16, 0}});
  const std::string output = output_of([&] { EXPECT_FALSE(run(wrong.get())); });
  EXPECT_EQ(test_support::count_of(output, "\n"), 2) << output;
  EXPECT_NE(output.find("ll_add_entry_to_back() BUG: This entry represents a different type"), std::string::npos);
  EXPECT_NE(output.find(error(filter, "Failed adding entry to the back of the list.")), std::string::npos);
}

TEST_F(VideoModeFilter, EveryFailedAllocationFailsTheFilter) {
  append(sink_->dtd_list, timing_of_vic(16));
  append_modes(sink_->video_list, {{4, 0}, {5, 0}});
  append_modes(values_->video_60_priority, {{16, 0}, {1, 0}, {4, 0}});
  values_->current_mode_set_to_priority = 1;
  cfg_.hdmi_current_mode = {1280, 720, 0, 60};

  bool failed = true;
  u32 room = 0;
  for (; failed; room += 8) {
    edid_composer::entry_arena_t arena;
    composer_fixtures::leave_room(&arena, room);
    composer_fixtures::arena_list_t<short_video_desc_t> selected(&arena);
    const std::string output = output_of([&] {
      const test_support::failing_allocation_t failing(1);
      const bool complete = _filter_video_modes(inputs(&arena), selected.get(), &journal_).complete;
      failed = failing.happened();
      EXPECT_EQ(complete, !failed);
    });
    EXPECT_EQ(output, failed ? no_memory + error(filter, "Failed creating entry.") : "");
    EXPECT_TRUE(ll_verify_integrity(selected.get()));
  }
  // Two priority entries that match, and the current mode.
  EXPECT_GT(room, 3 * sizeof(ll_entry_t));
}

TEST_F(VideoModeFilter, WithoutMemoryForCandidatesNamesTheListThatTheyAreOf) {
  const auto failure = [&] {
    return output_of([&] {
      const test_support::failing_allocation_t failing(1);
      EXPECT_FALSE(run());
    });
  };
  const std::string no_candidate = no_memory + error("_combine_lists", "Failed creating entry.");
  values_->geometry_limit = 1;
  append_modes(values_->video_60_additional, {{5, 0}});
  EXPECT_EQ(failure(), no_candidate + error(filter, "Failed combining 60Hz lists."));
  append_modes(sink_->video_list, {{4, 0}});
  EXPECT_EQ(failure(), no_candidate + error(filter, "Failed combining short video lists."));
}

}  // namespace

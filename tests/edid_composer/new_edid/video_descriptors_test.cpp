// The selected modes in the new EDID: padding, detailed timings, short video descriptors; and the whole trace.
#include <gtest/gtest.h>

#include <cstring>
#include <string>
#include <vector>

#include "edid_composer/composer_lines.h"
#include "edid_composer/new_edid/population_fixture.h"
#include "support/edid_builder.h"
#include "support/failing_allocation.h"

namespace {

using composer_lines::bug;
using composer_lines::error;
using composer_lines::trace;

using modes_t = std::vector<test_support::mode_pair_t>;

constexpr const char *function = "_populate_new_edid";

class PopulationModes : public composer_fixtures::Population {
 protected:
  modes_t new_modes() { return test_support::modes_of(new_.video_list); }
};

std::string too_few(int count) {
  return error(function,
               "The number of video formats to be encoded is less than 4! Padding until 4 is reached. Check the "
               "platform configuration file is correct. Number in the video list:" +
                   std::to_string(count));
}

const std::string empty_list = bug("_maximum_pixel_clock", "\tReceived a list that contains no entries. List:PTR");

std::string unknown_vic(u32 vic) {
  return test_support::warning_line(
      "utility", "convert_vic_to_dtd",
      "Invalid vic requested for conversion to a DTD. Requested VIC:" + std::to_string(vic) + " Range:0-64");
}

TEST_F(PopulationModes, FirstTwoAreTheDetailedTimings) {
  select({{31, 5}, {5, 0}, {19, 0}, {16, 0}});
  EXPECT_EQ(output(), "");
  const auto timings = test_support::elements_of<detailed_timing_t>(new_.dtd_list);
  ASSERT_EQ(timings.size(), 2U);
  const detailed_timing_t first = test_support::timing_of_vic(31);
  const detailed_timing_t second = test_support::timing_of_vic(5);
  EXPECT_EQ(test_support::timing_descriptor(timings[0]), test_support::timing_descriptor(first));
  EXPECT_EQ(test_support::timing_descriptor(timings[1]), test_support::timing_descriptor(second));
  EXPECT_EQ(timings[0].valid, 1);
  EXPECT_EQ(timings[0].pixel_clock, 148500000U);
  EXPECT_EQ(timings[1].progressive, 0);
}

TEST_F(PopulationModes, NoneBecomeFourOfVic1) {
  select({});
  EXPECT_EQ(output(), empty_list + too_few(0) + too_few(1) + too_few(2) + too_few(3));
  EXPECT_EQ(new_modes(), (modes_t{{1, 0}, {1, 0}, {1, 0}, {1, 0}}));
  const auto timings = test_support::elements_of<detailed_timing_t>(new_.dtd_list);
  ASSERT_EQ(timings.size(), 2U);
  EXPECT_EQ(timings[1].h_active, 640U);
}

TEST_F(PopulationModes, ThreeArePaddedByOne) {
  select({{16, 1}, {4, 0}, {31, 0}});
  EXPECT_EQ(output(), too_few(3));
  EXPECT_EQ(new_modes(), (modes_t{{16, 1}, {4, 0}, {31, 0}, {1, 0}}));
}

TEST_F(PopulationModes, UnknownVicAmongTheFirstTwoFails) {
  select({{16, 0}, {65, 0}, {4, 0}, {1, 0}});
  prepare();
  EXPECT_EQ(test_support::output_of([&] { EXPECT_FALSE(populate(&arena_)); }),
            unknown_vic(65) + bug("_maximum_pixel_clock", "\tFailed converting VIC:65 to a DTD.") + unknown_vic(65) +
                error(function, "Error converting vic to dtd. Vic:65:Unknown Value"));
  EXPECT_EQ(ll_size(&new_.dtd_list), 1);
}

TEST_F(PopulationModes, UnknownVicBehindTheFirstTwoIsCarriedThrough) {
  select({{16, 0}, {4, 0}, {65, 0}, {1, 0}});
  EXPECT_EQ(output(), unknown_vic(65) + bug("_maximum_pixel_clock", "\tFailed converting VIC:65 to a DTD."));
  EXPECT_EQ(new_modes(), (modes_t{{16, 0}, {4, 0}, {65, 0}, {1, 0}}));
}

TEST_F(PopulationModes, EveryFailedAllocationOfAModeFailsThePopulation) {
  select({{16, 0}, {4, 0}, {2, 0}});
  bool failed = true;
  u32 room = 0;
  for (; failed; room += 8) {
    prepare();
    edid_composer::entry_arena_t arena;
    composer_fixtures::leave_room(&arena, room);
    const std::string output = test_support::output_of([&] {
      const test_support::failing_allocation_t failing(1);
      const bool complete = populate(&arena);
      failed = failing.happened();
      EXPECT_EQ(complete, !failed);
    });
    const std::string failure = test_support::bug_line("linked_list", "ll_create_entry",
                                                       "calloc failed to allocate memory for the entry. ptr:PTR") +
                                error(function, "Failed creating entry.");
    EXPECT_EQ(output, too_few(3) + (failed ? failure : ""));
  }
  // The padding, two timings.
  EXPECT_GT(room, 3 * sizeof(ll_entry_t) + 2 * sizeof(detailed_timing_t));
}

TEST_F(PopulationModes, NewRecordsListThatRefusesATimingFailsThePopulation) {
  prepare();
  ASSERT_TRUE(ll_delete_list(&new_.dtd_list));
  ASSERT_TRUE(ll_init(&new_.dtd_list, "int"));
  const std::string output = test_support::output_of([&] { EXPECT_FALSE(populate(&arena_)); });
  EXPECT_EQ(test_support::count_of(output, "\n"), 2) << output;
  EXPECT_NE(output.find("ll_add_entry_to_back() BUG: This entry represents a different type"), std::string::npos);
  EXPECT_NE(output.find(error(function, "Failed adding entry to the back of the list.")), std::string::npos);
}

TEST_F(PopulationModes, WholePopulationIsTraced) {
  select({{16, 5}, {4, 2}, {2, 0}});
  selected_.push_back({1, 39, 7});
  values_->product_id = 0x12AB;
  values_->serial = 0xDEADBEEF;
  values_->week = 20;
  values_->year = 2014;
  std::strcpy(values_->monitor_name, "Box");
  values_->dc_30bit = 1;
  values_->dc_36bit = 1;
  values_->speaker_entry = 0x10F;
  const auto line = [](const char *message) { return trace(function, message); };
  EXPECT_EQ(traced_output(),
            line("Setting up the new EDID:") + line("\tProduct Code    = 0x12AB") +
                line("\tSerial Number   = 0xDEADBEEF") + line("\tweek            = 20") +
                line("\tyear            = 2014") + line("\tManufacturer ID = YYY") + line("\tMonitor Name    = Box") +
                line("\tNo hdmi specific downstream EDID available. Setting SPA to f.f.f.f") + line("\tdc_30bit = 1") +
                line("\tdc_36bit = 1") + line("\tspeaker = 3:0x00 2:0x01 1:0x0F") + line("\tNew EDID List of VICs:") +
                "\t\tVIC:16 1920x1080p60Hz16x9 FP  TBH       \n"
                "\t\tVIC:4 1280x720p60Hz16x9  SBSH        \n"
                "\t\tVIC:2 720x480p60Hz4x3          \n"
                "\t\tVIC:39 1920x10801250i50Hz16x9 FP SBSH TBH Native\n" +
                line("\tEncoding the video timings: Num:4") + line("\tCreating the first 2 DTDs.") +
                line("\t\tVIC:16 1920x1080p60Hz16x9") + line("\t\tVIC:4 1280x720p60Hz16x9") +
                line("\tEncoding the VIC list up to 31 modes. Total:4"));
}

}  // namespace

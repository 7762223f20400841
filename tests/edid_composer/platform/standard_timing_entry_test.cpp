// The grammar of a configured standard timing: width, height, refresh rate and its fraction.
#include "edid_composer/platform/standard_timing_entry.h"

#include <gtest/gtest.h>

#include <cstring>
#include <string>
#include <vector>

#include "edid_composer/composer_lines.h"
#include "edid_composer/platform/key_rows.h"
#include "edid_composer/platform/mode_lists.h"
#include "support/configuration_tree.h"
#include "support/failing_allocation.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using composer_lines::error;
using composer_lines::warning;
using edid_composer::_get_std_timing_callback;
using edid_composer::_get_std_timing_list;
using key_rows::key;
using test_support::output_of;

using timings_t = std::vector<test_support::std_timing_words_t>;

constexpr const char *parser = "_get_std_timing_callback";

std::string odd_width(const std::string &width, const std::string &node, const std::string &text) {
  return warning(parser,
                 "Standard timing width(" + width + ") must be a factor of 8. Entry:" + node + " = \"" + text + "\"");
}

/// @p heights is the text from "1:1=>" on.
std::string bad_ratio(const std::string &height, const std::string &width, const std::string &heights,
                      const std::string &text) {
  return warning(parser, "Height(" + height + ") is not in a proper ratio to width(" + width + "). Accepted heights " +
                             heights + " Entry:" + text + "\n");
}

std::string fraction(const std::string &rate, const std::string &text) {
  return warning(
      parser, "Only whole refresh rates(" + rate +
                  ") are supported, ie 60 not 59.94. Incrementing refresh rate and continuing. Entry:" + text + "\n");
}

std::string bad_rate(const std::string &rate, const std::string &text) {
  return warning(parser, "Invalid Refresh rate(" + rate + "). Must be 60 to 123. Entry:" + text + "\n");
}

class StandardTimingEntry : public testing::Test {
 protected:
  /// Reads a list of this entry alone, so that nothing of an earlier one is left in the buffer.
  std::string read(const std::string &entry) { return read_all({entry}); }

  std::string read_all(const std::vector<std::string> &entries) {
    tree_.clear();
    for (const std::string &entry : entries)
      tree_.add("standard_timings", entry);
    return output_of([&] { _get_std_timing_list(key("standard_timings"), list_.get(), nullptr, {}); });
  }
  timings_t timings() { return test_support::std_timings_of(*list_); }

  test_support::configuration_tree_t tree_;
  test_support::scoped_list_t<std_timing_t> list_;
};

TEST_F(StandardTimingEntry, HoldsWidthHeightAndRate) {
  EXPECT_EQ(read("1920 1080 60"), "");
  EXPECT_EQ(read("1280x1024x75"), "");
  EXPECT_EQ(read("1024,768@123Hz"), "");
  EXPECT_EQ(read("800/800-100"), "");
  EXPECT_EQ(timings(), (timings_t{{1920, 3, 60}, {1280, 2, 75}, {1024, 1, 123}, {800, 0, 100}}));
}

TEST_F(StandardTimingEntry, IsReadToTheEndOfTheLongestText) {
  EXPECT_EQ(read("00000000000000001280 1024 75"), "");
  EXPECT_EQ(timings(), (timings_t{{1280, 2, 75}}));
}

TEST_F(StandardTimingEntry, FractionOfZeroIsWhole) {
  EXPECT_EQ(read("1280 960 60.00"), "");
  EXPECT_EQ(timings(), (timings_t{{1280, 1, 60}}));
}

TEST_F(StandardTimingEntry, FractionIncrementsTheRate) {
  EXPECT_EQ(read("1280 1024 59.94"), fraction("59.94", "1280 1024 59.94"));
  EXPECT_EQ(read("1280x1024x74x5"), fraction("74.5", "1280x1024x74x5"));
  EXPECT_EQ(timings(), (timings_t{{1280, 2, 60}, {1280, 2, 75}}));
}

TEST_F(StandardTimingEntry, FractionIsReadAsANumber) {
  EXPECT_EQ(read("1280 1024 60.007"), fraction("60.7", "1280 1024 60.007"));
  EXPECT_EQ(timings(), (timings_t{{1280, 2, 61}}));
}

TEST_F(StandardTimingEntry, WidthIsAMultipleOfEight) {
  EXPECT_EQ(read("1366 768 60"), odd_width("1366", "entry_0", "1366 768 60"));
  EXPECT_EQ(timings(), timings_t{});
}

TEST_F(StandardTimingEntry, HeightIsInARatioThatAStandardTimingHas) {
  EXPECT_EQ(read("1280 1000 60"), bad_ratio("1000", "1280", "1:1=>1280 4:3=>960 5:4=>1600 16:9=>2275", "1280 1000 60"));
  EXPECT_EQ(timings(), timings_t{});
}

TEST_F(StandardTimingEntry, RateIs60To123) {
  EXPECT_EQ(read("1920 1080 124"), bad_rate("124", "1920 1080 124"));
  EXPECT_EQ(read("1920 1080 59"), bad_rate("59", "1920 1080 59"));
  EXPECT_EQ(read("1920 1080 123.5"), fraction("123.5", "1920 1080 123.5") + bad_rate("124", "1920 1080 123.5"));
  EXPECT_EQ(read("1920 1080 58.9"), fraction("58.9", "1920 1080 58.9") + bad_rate("59", "1920 1080 58.9"));
  EXPECT_EQ(timings(), timings_t{});
}

TEST_F(StandardTimingEntry, WidthIsJudgedFirstThenTheRatioThenTheRate) {
  EXPECT_EQ(read("1366 1 5.5"), odd_width("1366", "entry_0", "1366 1 5.5"));
  EXPECT_EQ(read("1360 1 5.5"), bad_ratio("1", "1360", "1:1=>1360 4:3=>1020 5:4=>1700 16:9=>2417", "1360 1 5.5"));
}

TEST_F(StandardTimingEntry, MissingNumbersAreZero) {
  EXPECT_EQ(read(""), bad_rate("0", ""));
  EXPECT_EQ(read("abc"), bad_rate("0", "abc"));
  EXPECT_EQ(read("640 480"), bad_rate("0", "640 480"));
  EXPECT_EQ(read("640"), bad_ratio("0", "640", "1:1=>640 4:3=>480 5:4=>800 16:9=>1137", "640"));
  EXPECT_EQ(read("0 0 60"), "");
  EXPECT_EQ(timings(), (timings_t{{0, 0, 60}}));
}

TEST_F(StandardTimingEntry, NumbersAreSeparatedByExactlyOneCharacter) {
  EXPECT_EQ(read("1280  960 60"), bad_ratio("0", "1280", "1:1=>1280 4:3=>960 5:4=>1600 16:9=>2275", "1280  960 60"));
  EXPECT_EQ(read(" 1280 960 60"), bad_ratio("1280", "0", "1:1=>0 4:3=>0 5:4=>0 16:9=>0", " 1280 960 60"));
  EXPECT_EQ(timings(), timings_t{});
}

TEST_F(StandardTimingEntry, RestOfALongerEntryBeforeIsReadAsTheFraction) {
  EXPECT_EQ(
      read_all({"1280 1024 59.94", "1920 1080 124"}),
      fraction("59.94", "1280 1024 59.94") + fraction("124.4", "1920 1080 124") + bad_rate("125", "1920 1080 124"));
  EXPECT_EQ(timings(), (timings_t{{1280, 2, 60}}));
}

TEST_F(StandardTimingEntry, SizeIsNotHeldToWhatAStandardTimingCanEncode) {
  EXPECT_EQ(read("8 8 60"), "");
  EXPECT_EQ(read("4096 2304 60"), "");
  EXPECT_EQ(timings(), (timings_t{{8, 0, 60}, {4096, 3, 60}}));
}

TEST_F(StandardTimingEntry, NumbersOfAnySizeKeepTheirLow32Bits) {
  EXPECT_EQ(read("4294967288 5 60"), bad_ratio("5", "-8", "1:1=>-8 4:3=>-6 5:4=>-10 16:9=>-14", "4294967288 5 60"));
  EXPECT_EQ(read("99999999999999999999 8 60"), odd_width("-1", "entry_0", "99999999999999999999 8 60"));
  EXPECT_EQ(read("4294968576 1024 60"), "");  // 2^32 + 1280
  EXPECT_EQ(timings(), (timings_t{{1280, 2, 60}}));
}

TEST_F(StandardTimingEntry, SuggestedHeightsWrapBeforeTheyAreDivided) {
  EXPECT_EQ(read("1073741824 7 60"),
            bad_ratio("7", "1073741824", "1:1=>1073741824 4:3=>-268435456 5:4=>268435456 16:9=>0", "1073741824 7 60"));
}

TEST_F(StandardTimingEntry, IncrementedRateWraps) {
  EXPECT_EQ(read("8 8 2147483647.5"),
            fraction("2147483647.5", "8 8 2147483647.5") + bad_rate("-2147483648", "8 8 2147483647.5"));
}

TEST_F(StandardTimingEntry, NumbersThatFillTheBufferLeaveNoneBehindIt) {
  // The third number ends at the last byte, so the fraction would begin after the buffer.
  const edid_composer::configuration_entry_t entry{
      &key("standard_timings"), 0, edid_composer::entry_kind_t::text, "node", -1, "00000000008 0000000008 000061"};
  ASSERT_EQ(std::strlen(entry.text), sizeof entry.text - 1);
  EXPECT_EQ(output_of([&] {
              EXPECT_EQ(_get_std_timing_callback(entry, list_.get(), nullptr).reason,
                        CONFIGURATION_WIDTH_NOT_ENCODABLE);
            }),
            "");
  EXPECT_EQ(timings(), (timings_t{{8, 0, 61}}));
}

TEST_F(StandardTimingEntry, RatioThatIsNoneIsTracedByTheConversion) {
  tree_.add("standard_timings", std::string("1280 1000 60"), "node");
  EXPECT_EQ(
      test_support::traced_output_of([&] { _get_std_timing_list(key("standard_timings"), list_.get(), nullptr, {}); }),
      composer_lines::trace("print_platform_node", "\tRoot Node:Name of node is:standard_timings") +
          composer_lines::trace("print_platform_node", "\tFirst Child Node:Name of node is:node") +
          composer_lines::trace("print_platform_node", "\tNext Node:Name of node is:node") +
          composer_lines::trace("convert_geo_to_ratio",
                                "Got a set of values that didn't match an aspect ratio. width=1280 height=1000") +
          bad_ratio("1000", "1280", "1:1=>1280 4:3=>960 5:4=>1600 16:9=>2275", "1280 1000 60"));
}

TEST_F(StandardTimingEntry, ThatTheListRefusesIsReportedAndTheWalkGoesOn) {
  ASSERT_TRUE(ll_delete_list(list_.get()));
  ASSERT_TRUE(ll_init(list_.get(), "int"));
  const std::string output = read_all({"1280 1024 60", "1920 1080 60"});
  EXPECT_EQ(test_support::count_of(output, error(parser, "Failed adding entry to the back of the list.")), 2);
  EXPECT_EQ(test_support::count_of(output, "\n"), 4);
}

TEST_F(StandardTimingEntry, WithoutMemoryIsReportedAndTheWalkGoesOn) {
  tree_.add("standard_timings", std::string("1280 1024 60"));
  tree_.add("standard_timings", std::string("1920 1080 60"));
  EXPECT_EQ(output_of([&] {
              const test_support::failing_allocation_t failing(2);
              _get_std_timing_list(key("standard_timings"), list_.get(), nullptr, {});
            }),
            test_support::bug_line("linked_list", "ll_create_entry",
                                   "calloc failed to allocate memory for the data storage. ptr:PTR") +
                error(parser, "Failed creating entry."));
  EXPECT_EQ(timings(), (timings_t{{1920, 3, 60}}));
}

}  // namespace

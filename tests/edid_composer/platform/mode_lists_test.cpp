// The lists of the configuration, and the entries that are numbers: 4Kx2K modes and the bits of established and
// manufacturer's timings.
#include "edid_composer/platform/mode_lists.h"

#include <gtest/gtest.h>

#include <iterator>
#include <ostream>
#include <string>
#include <vector>

#include "edid_composer/composer_lines.h"
#include "edid_composer/platform/key_rows.h"
#include "support/configuration_tree.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using composer_lines::error;
using composer_lines::trace;
using composer_lines::warning;
using edid_composer::_get_4k_x_2k_modes;
using edid_composer::_get_est_timing_list;
using edid_composer::_get_platform_list;
using edid_composer::_get_std_timing_list;
using key_rows::key;
using key_rows::row;
using test_support::configuration_tree_t;
using test_support::output_of;
using test_support::traced_output_of;

using slots_t = std::vector<i32>;

const std::string domain = "platform.software.drivers.vorex.edid.";

std::string unabled(const std::string &path) {
  return error("_get_generic_platform_list", "Unabled to find the platform node:" + path + ".\n");
}

std::string empty_list(const std::string &type) {
  return error("_get_platform_list",
               "A mode list (" + type +
                   ") is empty. Please verify that all of the video mode lists are properly populated with 3D mode "
                   "formated strings.\n");
}

class Mode4kEntry : public testing::Test {
 protected:
  std::string read(const slots_t &entries) {
    for (const i32 entry : entries)
      tree_.add("4k_x_2k_priority_list", entry);
    return output_of([&] { _get_4k_x_2k_modes(key("4k_x_2k_priority_list"), modes_, {}); });
  }
  slots_t slots() const { return {std::begin(modes_), std::end(modes_)}; }

  configuration_tree_t tree_;
  i32 modes_[7]{};
};

std::string unsupported_mode(const std::string &mode, const std::string &node) {
  return warning("_get_4k_x_2k_mode_callback",
                 "Detected a 4k x 2k mode that is not supported. Max:4 Received:" + mode + " Node:" + node);
}

TEST_F(Mode4kEntry, IsStoredInTheNextSlot) {
  EXPECT_EQ(read({3, 1}), "");
  EXPECT_EQ(slots(), (slots_t{3, 1, 0, 0, 0, 0, 0}));
}

TEST_F(Mode4kEntry, OutsideTheModesIsSkipped) {
  EXPECT_EQ(read({5, 4, 0, -1, 1}),
            unsupported_mode("5", "entry_0") + unsupported_mode("0", "entry_2") + unsupported_mode("-1", "entry_3"));
  EXPECT_EQ(slots(), (slots_t{4, 1, 0, 0, 0, 0, 0}));
}

TEST_F(Mode4kEntry, MayBeRepeated) {
  EXPECT_EQ(read({1, 1, 2, 1}), "");
  EXPECT_EQ(slots(), (slots_t{1, 1, 2, 1, 0, 0, 0}));
}

TEST_F(Mode4kEntry, SlotsAreCountedFromTheFirstForEachList) {
  tree_.add("4k_x_2k_addition_list", 4);
  EXPECT_EQ(read({1, 2}), "");
  i32 addition[7]{};
  _get_4k_x_2k_modes(key("4k_x_2k_addition_list"), addition, {});
  EXPECT_EQ(addition[0], 4);
  EXPECT_EQ(addition[1], 0);
}

TEST_F(Mode4kEntry, FirstSevenAreKeptAndTheOthersLeaveNoTrace) {
  EXPECT_EQ(read({1, 2, 3, 4, 3, 2, 1, 4, 3}), "");
  EXPECT_EQ(slots(), (slots_t{1, 2, 3, 4, 3, 2, 1}));
  const std::string traced = traced_output_of([&] { _get_4k_x_2k_modes(key("4k_x_2k_priority_list"), modes_, {}); });
  EXPECT_EQ(test_support::count_of(traced, trace("_get_4k_x_2k_mode_callback", "Read 4k x 2k mode:2")), 2);
  EXPECT_EQ(test_support::count_of(traced, "Read 4k x 2k mode:"), 7);
}

class TimingBitEntry : public testing::Test {
 protected:
  std::string read(const char *list, const slots_t &entries) {
    for (const i32 entry : entries)
      tree_.add(list, entry);
    return output_of([&] { _get_est_timing_list(key(list), &mask_, {}); });
  }

  configuration_tree_t tree_;
  u32 mask_ = 0;
};

std::string invalid_bit(const std::string &bit, const std::string &node) {
  return warning("_get_est_timing_callback", "Mode value is not 0 to 7. Val:" + bit + " Node:" + node);
}

TEST_F(TimingBitEntry, SetsItsBit) {
  EXPECT_EQ(read("established_timings_1", {0, 7}), "");
  EXPECT_EQ(mask_, 0x81U);
}

TEST_F(TimingBitEntry, AllEightBitsRepeatedOrNotFillTheMask) {
  EXPECT_EQ(read("established_timings_2", {7, 6, 5, 4, 3, 2, 1, 0, 7, 0, 3}), "");
  EXPECT_EQ(mask_, 0xFFU);
}

TEST_F(TimingBitEntry, OutsideTheByteIsSkipped) {
  EXPECT_EQ(read("manufacturer_timings", {8, 7, -1, 31}),
            invalid_bit("8", "entry_0") + invalid_bit("-1", "entry_2") + invalid_bit("31", "entry_3"));
  EXPECT_EQ(mask_, 0x80U);
}

TEST_F(TimingBitEntry, IsAddedToWhatTheMaskHolds) {
  mask_ = 0x10;
  EXPECT_EQ(read("manufacturer_timings", {0}), "");
  EXPECT_EQ(mask_, 0x11U);
}

TEST_F(TimingBitEntry, IsTracedWithItsList) {
  tree_.add("established_timings_1", 3);
  const std::string traced = traced_output_of([&] { _get_est_timing_list(key("established_timings_1"), &mask_, {}); });
  EXPECT_NE(traced.find(trace("_get_est_timing_callback", "Added timing val:3 for list:established_timings_1")),
            std::string::npos);
}

struct video_list_t {
  u32 number;
  const char *key;
  const char *reading;
};

std::ostream &operator<<(std::ostream &out, const video_list_t &list) {
  return out << list.key;
}

class VideoListReader : public testing::TestWithParam<video_list_t> {
 protected:
  configuration_tree_t tree_;
  test_support::scoped_list_t<short_video_desc_t> list_;
};

TEST_P(VideoListReader, ReadsTheListOfItsType) {
  for (const char *key : {"50_hz_priority_list", "60_hz_priority_list", "50_hz_addition_list", "60_hz_addition_list"}) {
    tree_.add(key, std::string(key == std::string(GetParam().key) ? "16 FP" : "1"));
  }
  const std::string node = std::string("Node:Name of node is:");
  EXPECT_EQ(traced_output_of([&] { _get_platform_list(row(GetParam().key), list_.get(), nullptr, {}); }),
            trace("_get_platform_list", std::string("Reading ") + GetParam().reading + " list from platform config.") +
                trace("print_platform_node", "\tRoot " + node + GetParam().key) +
                trace("print_platform_node", "\tFirst Child " + node + "entry_0") +
                trace("print_platform_node", "\tNext " + node + "entry_0") +
                trace("_get_vic_list_callback",
                      std::string("Reading from list:") + GetParam().key + " Node:entry_0 => 16 FP") +
                trace("_get_vic_list_callback", "\tFound list entry: entry_0 = \"16 FP  \""));
  EXPECT_EQ(test_support::modes_of(*list_), (std::vector<test_support::mode_pair_t>{{16, 1}}));
}

TEST_P(VideoListReader, ReportsAnEmptyListByItsType) {
  tree_.add_list(GetParam().key);
  EXPECT_EQ(output_of([&] { _get_platform_list(row(GetParam().key), list_.get(), nullptr, {}); }),
            empty_list(std::to_string(GetParam().number)));
}

TEST_P(VideoListReader, ReportsAMissingNodeAndThenTheEmptyList) {
  EXPECT_EQ(output_of([&] { _get_platform_list(row(GetParam().key), list_.get(), nullptr, {}); }),
            unabled(domain + GetParam().key) + empty_list(std::to_string(GetParam().number)));
}

TEST_P(VideoListReader, KeepsWhatTheDestinationHeldAndCallsItNotEmpty) {
  test_support::append_modes(*list_, {{4, 0}});
  EXPECT_EQ(output_of([&] { _get_platform_list(row(GetParam().key), list_.get(), nullptr, {}); }),
            unabled(domain + GetParam().key));
  EXPECT_EQ(ll_size(list_.get()), 1);
}

INSTANTIATE_TEST_SUITE_P(PlatformModeLists, VideoListReader,
                         testing::Values(video_list_t{0, "50_hz_priority_list", "50Hz priority"},
                                         video_list_t{1, "60_hz_priority_list", "60Hz priority"},
                                         video_list_t{2, "50_hz_addition_list", "50Hz additional"},
                                         video_list_t{3, "60_hz_addition_list", "60Hz additional"}));

TEST(PlatformModeLists, MissingListsLeaveTheirDestinationsAlone) {
  const configuration_tree_t tree;
  i32 modes[7]{};
  u32 mask = 0x40;
  test_support::scoped_list_t<std_timing_t> timings;
  EXPECT_EQ(output_of([&] {
              _get_4k_x_2k_modes(key("4k_x_2k_priority_list"), modes, {});
              _get_est_timing_list(key("established_timings_1"), &mask, {});
              _get_std_timing_list(key("standard_timings"), timings.get(), nullptr, {});
            }),
            unabled(domain + "4k_x_2k_priority_list") + unabled(domain + "established_timings_1") +
                unabled(domain + "standard_timings"));
  EXPECT_EQ(modes[0], 0);
  EXPECT_EQ(mask, 0x40U);
  EXPECT_EQ(ll_size(timings.get()), 0);
}

}  // namespace

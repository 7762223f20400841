// The walk over a list of the configuration, the trace of its nodes, and the readers that start it.
#include "edid_composer/platform_mode_lists.h"

#include <gtest/gtest.h>

#include <ostream>
#include <string>
#include <vector>

#include "composer_lines.h"
#include "support/configuration_tree.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using composer_lines::bug;
using composer_lines::error;
using composer_lines::trace;
using edid_composer::_get_4k_x_2k_modes;
using edid_composer::_get_est_timing_list;
using edid_composer::_get_generic_platform_list;
using edid_composer::_get_platform_list;
using edid_composer::_get_std_timing_list;
using test_support::config_operation_t;
using test_support::configuration_tree_t;
using test_support::output_of;
using test_support::traced_output_of;

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

/// What the walk handed to its callback.
struct seen_entry_t {
  std::string node_name;
  std::string list_name;
  i32 int_value;
  std::string whole_buffer;
  u32 string_size;

  bool operator==(const seen_entry_t &) const = default;
};

std::string buffer_with(const std::string &text) {
  std::string buffer = text;
  buffer.resize(30, '\0');
  return buffer;
}

bool remember(const char *node_name, const char *list_name, i32 int_value, char *string_value, u32 string_size,
              void *context) {
  static_cast<std::vector<seen_entry_t> *>(context)->push_back(
      {node_name, list_name, int_value, std::string(string_value, 30), string_size});
  return false;  // Which must not stop the walk.
}

class PlatformListWalk : public testing::Test {
 protected:
  std::string walk(const char *list_name, bool is_int) {
    return output_of([&] { EXPECT_TRUE(_get_generic_platform_list(list_name, is_int, &seen_, remember)); });
  }

  configuration_tree_t tree_;
  std::vector<seen_entry_t> seen_;
};

TEST_F(PlatformListWalk, ListWithoutNameIsABug) {
  EXPECT_EQ(walk(nullptr, true), bug("_get_generic_platform_list", "Timing List name is NULL."));
  EXPECT_EQ(walk("", false), bug("_get_generic_platform_list", "Timing List name is NULL."));
  EXPECT_EQ(tree_.lookups(), 0);
}

TEST_F(PlatformListWalk, MissingCallbackIsABugThatComesAfterTheName) {
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(_get_generic_platform_list("modes", true, &seen_, nullptr)); }),
            bug("_get_generic_platform_list", "Callback function pointer is NULL. list_name:modes"));
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(_get_generic_platform_list("", true, &seen_, nullptr)); }),
            bug("_get_generic_platform_list", "Timing List name is NULL."));
  EXPECT_EQ(tree_.lookups(), 0);
}

TEST_F(PlatformListWalk, MissingNodeIsAnErrorWithAnEmptyLine) {
  EXPECT_EQ(walk("modes", false), unabled(domain + "modes"));
  EXPECT_TRUE(seen_.empty());
}

TEST_F(PlatformListWalk, LongPathIsCutToItsBuffer) {
  const std::string name(200, 'n');
  const std::string path = (domain + name).substr(0, 127);
  EXPECT_EQ(walk(name.c_str(), false), unabled(path));
  EXPECT_EQ(tree_.calls().at(0).path, path);
}

TEST_F(PlatformListWalk, OnlyStatusTwoMeansNotFound) {
  tree_.add("modes", 3);
  for (const int status : {0, 1, 3, -1}) {
    seen_.clear();
    tree_.answer(config_operation_t::node_find, status);
    tree_.answer(config_operation_t::node_first_child, status);
    EXPECT_EQ(walk("modes", true), "");
    EXPECT_EQ(seen_.size(), 1U) << status;
  }
  tree_.answer(config_operation_t::node_find, 2);
  EXPECT_EQ(walk("modes", true), unabled(domain + "modes"));
}

TEST_F(PlatformListWalk, AnyStatusButZeroOfTheNextEntryEndsIt) {
  tree_.add("modes", 3);
  tree_.add("modes", 4);
  for (const int status : {1, 2, -1}) {
    seen_.clear();
    tree_.answer(config_operation_t::node_next_sibling, status);
    EXPECT_EQ(walk("modes", true), "");
    EXPECT_EQ(seen_.size(), 1U) << status;
  }
}

TEST_F(PlatformListWalk, ListWithoutEntriesIsSilent) {
  tree_.add_list("modes");
  EXPECT_EQ(walk("modes", true), "");
  EXPECT_EQ(walk("modes", false), "");
  EXPECT_TRUE(seen_.empty());
}

TEST_F(PlatformListWalk, IntegersReachTheCallbackInOrderWhateverItAnswers) {
  tree_.add("modes", 3, "b");
  tree_.add("modes", -7, "a");
  tree_.add("modes", 0);
  EXPECT_EQ(walk("modes", true), "");
  EXPECT_EQ(seen_, (std::vector<seen_entry_t>{{"b", "modes", 3, buffer_with(""), 30},
                                              {"a", "modes", -7, buffer_with(""), 30},
                                              {"entry_2", "modes", 0, buffer_with(""), 30}}));
}

TEST_F(PlatformListWalk, TextsReachTheCallbackWithMinusOneAsTheirNumber) {
  tree_.add("modes", std::string("16 FP"));
  tree_.add("modes", std::string("4 TBH SBSH"));
  EXPECT_EQ(walk("modes", false), "");
  EXPECT_EQ(seen_, (std::vector<seen_entry_t>{{"entry_0", "modes", -1, buffer_with("16 FP"), 30},
                                              {"entry_1", "modes", -1, buffer_with("4 TBH SBSH"), 30}}));
}

TEST_F(PlatformListWalk, LongerTextBeforeLeavesItsRestBehindTheEndOfTheNextOne) {
  tree_.add("modes", std::string("abcdefgh"));
  tree_.add("modes", std::string("xyz"));
  EXPECT_EQ(walk("modes", false), "");
  ASSERT_EQ(seen_.size(), 2U);
  EXPECT_EQ(seen_[1].whole_buffer, buffer_with(std::string("xyz\0efgh", 8)));
}

TEST_F(PlatformListWalk, TextIsReadWithOneByteLessThanTheBuffer) {
  tree_.add("modes", std::string(60, 'x'));
  EXPECT_EQ(walk("modes", false), "");
  ASSERT_EQ(seen_.size(), 1U);
  EXPECT_EQ(seen_[0].whole_buffer, buffer_with(std::string(28, 'x')));
  for (const auto &call : tree_.calls()) {
    const bool reads_text = call.operation == config_operation_t::node_get_str;
    const bool reads_name = call.operation == config_operation_t::node_get_name;
    EXPECT_EQ(call.size, reads_text ? 29U : reads_name ? 256U : 0U);
  }
}

TEST_F(PlatformListWalk, EntryThatIsNoIntegerIsSkippedWithAnError) {
  tree_.add("modes", 1);
  tree_.add("modes", std::string("2"), "text");
  tree_.add_empty("modes", "nothing");
  tree_.add("modes", 3);
  EXPECT_EQ(walk("modes", true),
            error("_get_generic_platform_list",
                  "Invalid platform configuration entry. Expected an integer. Entry name:text") +
                error("_get_generic_platform_list",
                      "Invalid platform configuration entry. Expected an integer. Entry name:nothing"));
  ASSERT_EQ(seen_.size(), 2U);
  EXPECT_EQ(seen_[1].int_value, 3);
}

TEST_F(PlatformListWalk, EntryThatIsNoTextIsSkippedWithAnErrorAndAnEmptyLine) {
  tree_.add("modes", 16, "number");
  tree_.add("modes", std::string("4"));
  tree_.add_empty("modes", "nothing");
  EXPECT_EQ(walk("modes", false),
            error("_get_generic_platform_list",
                  "Invalid platform configuration entry. Expected a string. Entry name:number\n") +
                error("_get_generic_platform_list",
                      "Invalid platform configuration entry. Expected a string. Entry name:nothing\n"));
  ASSERT_EQ(seen_.size(), 1U);
  EXPECT_EQ(seen_[0].node_name, "entry_1");
}

TEST_F(PlatformListWalk, NodeNameIsUsedWhateverTheStatusOfItsReading) {
  tree_.add("modes", 5, "named");
  tree_.answer(config_operation_t::node_get_name, 1);
  EXPECT_EQ(walk("modes", true), "");
  ASSERT_EQ(seen_.size(), 1U);
  EXPECT_EQ(seen_[0].node_name, "named");
}

TEST_F(PlatformListWalk, NodesAreTraced) {
  tree_.add("modes", 1, "one");
  tree_.add("modes", 2, "two");
  EXPECT_EQ(traced_output_of([&] { EXPECT_TRUE(_get_generic_platform_list("modes", true, &seen_, remember)); }),
            trace("print_platform_node", "\tRoot Node:Name of node is:modes") +
                trace("print_platform_node", "\tFirst Child Node:Name of node is:one") +
                trace("print_platform_node", "\tNext Node:Name of node is:one") +
                trace("print_platform_node", "\tNext Node:Name of node is:two"));
}

TEST(PlatformNode, IsTracedByItsName) {
  configuration_tree_t tree;
  tree.add("modes", 1, "one");
  u32 list = 0;
  ASSERT_EQ(config_node_find(0, (domain + "modes").c_str(), &list), 0);
  EXPECT_EQ(traced_output_of([&] { print_platform_node(list, "Here"); }),
            trace("print_platform_node", "Here:Name of node is:modes"));
}

TEST(PlatformNode, WithoutNameIsTracedAsSuch) {
  configuration_tree_t tree;
  tree.add_list("modes");
  u32 list = 0;
  ASSERT_EQ(config_node_find(0, (domain + "modes").c_str(), &list), 0);
  tree.answer(config_operation_t::node_get_name, 1);
  EXPECT_EQ(traced_output_of([&] { print_platform_node(list, "Here"); }),
            trace("print_platform_node", "Here:Failed trying to get name"));
}

TEST(PlatformNode, IsNotEvenReadWhileTracingIsOff) {
  const configuration_tree_t tree;
  EXPECT_EQ(output_of([&] { print_platform_node(0, "Here"); }), "");
  EXPECT_EQ(tree.lookups(), 0);
}

struct video_list_t {
  u32 type;
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
  EXPECT_EQ(traced_output_of([&] { EXPECT_TRUE(_get_platform_list(GetParam().type, list_.get())); }),
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
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(_get_platform_list(GetParam().type, list_.get())); }),
            empty_list(std::to_string(GetParam().type)));
}

TEST_P(VideoListReader, ReportsAMissingNodeAndThenTheEmptyList) {
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(_get_platform_list(GetParam().type, list_.get())); }),
            unabled(domain + GetParam().key) + empty_list(std::to_string(GetParam().type)));
}

TEST_P(VideoListReader, KeepsWhatTheDestinationHeldAndCallsItNotEmpty) {
  test_support::append_modes(*list_, {{4, 0}});
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(_get_platform_list(GetParam().type, list_.get())); }),
            unabled(domain + GetParam().key));
  EXPECT_EQ(ll_size(list_.get()), 1);
}

TEST_P(VideoListReader, DoesNotCallAMissingDestinationEmpty) {
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(_get_platform_list(GetParam().type, nullptr)); }),
            unabled(domain + GetParam().key));
}

INSTANTIATE_TEST_SUITE_P(PlatformModeLists, VideoListReader,
                         testing::Values(video_list_t{0, "50_hz_priority_list", "50Hz priority"},
                                         video_list_t{1, "60_hz_priority_list", "60Hz priority"},
                                         video_list_t{2, "50_hz_addition_list", "50Hz additional"},
                                         video_list_t{3, "60_hz_addition_list", "60Hz additional"}));

TEST(PlatformModeLists, UnknownTypeOfVideoListIsRefused) {
  const configuration_tree_t tree;
  test_support::scoped_list_t<short_video_desc_t> list;
  EXPECT_EQ(traced_output_of([&] { EXPECT_FALSE(_get_platform_list(4, list.get())); }),
            error("_get_platform_list", "\"type\" parameter is an invalid value. type:4 range:(0-3)"));
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(_get_platform_list(0xFFFFFFFF, list.get())); }),
            error("_get_platform_list", "\"type\" parameter is an invalid value. type:-1 range:(0-3)"));
  EXPECT_EQ(tree.lookups(), 0);
}

TEST(PlatformModeLists, MissingListsLeaveTheirDestinationsAlone) {
  const configuration_tree_t tree;
  i32 modes[7]{};
  u32 mask = 0x40;
  test_support::scoped_list_t<std_timing_t> timings;
  EXPECT_EQ(output_of([&] {
              _get_4k_x_2k_modes("4k_x_2k_priority_list", modes);
              _get_est_timing_list("established_timings_1", &mask);
              _get_std_timing_list(timings.get());
            }),
            unabled(domain + "4k_x_2k_priority_list") + unabled(domain + "established_timings_1") +
                unabled(domain + "standard_timings"));
  EXPECT_EQ(modes[0], 0);
  EXPECT_EQ(mask, 0x40U);
  EXPECT_EQ(ll_size(timings.get()), 0);
}

}  // namespace

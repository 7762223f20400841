// The walk over a list of the configuration, and the trace of its nodes.
#include "edid_composer/platform/configuration_list.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "edid_composer/composer_lines.h"
#include "support/configuration_tree.h"
#include "support/output_capture.h"

namespace {

using composer_lines::error;
using composer_lines::trace;
using edid_composer::_get_generic_platform_list;
using edid_composer::configuration_entry_t;
using edid_composer::entry_kind_t;
using test_support::config_operation_t;
using test_support::configuration_tree_t;
using test_support::output_of;
using test_support::traced_output_of;

const std::string domain = "platform.software.drivers.vorex.edid.";

std::string unabled(const std::string &path) {
  return error("_get_generic_platform_list", "Unabled to find the platform node:" + path + ".\n");
}

struct seen_entry_t {
  std::string node_name;
  std::string list_name;
  i32 number;
  std::string whole_buffer;

  bool operator==(const seen_entry_t &) const = default;
};

std::string buffer_with(const std::string &text) {
  std::string buffer = text;
  buffer.resize(30, '\0');
  return buffer;
}

class ConfigurationList : public testing::Test {
 protected:
  /// Walks over a list whose key no table holds; keeps the entries of its kind.
  void read(const char *list_name, entry_kind_t kind) {
    const std::string path = domain + list_name;
    configuration_key_t key{};
    key.kind = kind == entry_kind_t::number ? CONFIGURATION_TIMING_BITS : CONFIGURATION_VIDEO_MODES;
    key.path = path.c_str();
    key.name = list_name;
    i32 index = 0;
    for (const configuration_entry_t &entry : _get_generic_platform_list(key)) {
      EXPECT_EQ(entry.index, index++);
      if (entry.kind == entry_kind_t::other) continue;
      EXPECT_EQ(entry.kind, kind);
      seen_.push_back({entry.node_name, entry.key->name, entry.number, std::string(entry.text, sizeof entry.text)});
    }
  }
  std::string walk(const char *list_name, entry_kind_t kind) {
    return output_of([&] { read(list_name, kind); });
  }

  configuration_tree_t tree_;
  std::vector<seen_entry_t> seen_;
};

TEST_F(ConfigurationList, MissingNodeIsAnErrorWithAnEmptyLine) {
  EXPECT_EQ(walk("modes", entry_kind_t::text), unabled(domain + "modes"));
  EXPECT_TRUE(seen_.empty());
}

TEST_F(ConfigurationList, OnlyStatusTwoMeansNotFound) {
  tree_.add("modes", 3);
  for (const int status : {0, 1, 3, -1}) {
    seen_.clear();
    tree_.answer(config_operation_t::node_find, status);
    tree_.answer(config_operation_t::node_first_child, status);
    EXPECT_EQ(walk("modes", entry_kind_t::number), "");
    EXPECT_EQ(seen_.size(), 1U) << status;
  }
  tree_.answer(config_operation_t::node_find, 2);
  EXPECT_EQ(walk("modes", entry_kind_t::number), unabled(domain + "modes"));
}

TEST_F(ConfigurationList, AnyStatusButZeroOfTheNextEntryEndsIt) {
  tree_.add("modes", 3);
  tree_.add("modes", 4);
  for (const int status : {1, 2, -1}) {
    seen_.clear();
    tree_.answer(config_operation_t::node_next_sibling, status);
    EXPECT_EQ(walk("modes", entry_kind_t::number), "");
    EXPECT_EQ(seen_.size(), 1U) << status;
  }
}

TEST_F(ConfigurationList, ListWithoutEntriesIsSilent) {
  tree_.add_list("modes");
  EXPECT_EQ(walk("modes", entry_kind_t::number), "");
  EXPECT_EQ(walk("modes", entry_kind_t::text), "");
  EXPECT_TRUE(seen_.empty());
}

TEST_F(ConfigurationList, IntegersComeInOrder) {
  tree_.add("modes", 3, "b");
  tree_.add("modes", -7, "a");
  tree_.add("modes", 0);
  EXPECT_EQ(walk("modes", entry_kind_t::number), "");
  EXPECT_EQ(seen_, (std::vector<seen_entry_t>{{"b", "modes", 3, buffer_with("")},
                                              {"a", "modes", -7, buffer_with("")},
                                              {"entry_2", "modes", 0, buffer_with("")}}));
}

TEST_F(ConfigurationList, TextsComeWithMinusOneAsTheirNumber) {
  tree_.add("modes", std::string("16 FP"));
  tree_.add("modes", std::string("4 TBH SBSH"));
  EXPECT_EQ(walk("modes", entry_kind_t::text), "");
  EXPECT_EQ(seen_, (std::vector<seen_entry_t>{{"entry_0", "modes", -1, buffer_with("16 FP")},
                                              {"entry_1", "modes", -1, buffer_with("4 TBH SBSH")}}));
}

TEST_F(ConfigurationList, LongerTextBeforeLeavesItsRestBehindTheEndOfTheNextOne) {
  tree_.add("modes", std::string("abcdefgh"));
  tree_.add("modes", std::string("xyz"));
  EXPECT_EQ(walk("modes", entry_kind_t::text), "");
  ASSERT_EQ(seen_.size(), 2U);
  EXPECT_EQ(seen_[1].whole_buffer, buffer_with(std::string("xyz\0efgh", 8)));
}

TEST_F(ConfigurationList, TextIsReadWithOneByteLessThanTheBuffer) {
  tree_.add("modes", std::string(60, 'x'));
  EXPECT_EQ(walk("modes", entry_kind_t::text), "");
  ASSERT_EQ(seen_.size(), 1U);
  EXPECT_EQ(seen_[0].whole_buffer, buffer_with(std::string(28, 'x')));
  for (const auto &call : tree_.calls()) {
    const bool reads_text = call.operation == config_operation_t::node_get_str;
    const bool reads_name = call.operation == config_operation_t::node_get_name;
    EXPECT_EQ(call.size, reads_text ? 29U : reads_name ? 256U : 0U);
  }
}

TEST_F(ConfigurationList, EntryThatIsNoIntegerIsSkippedWithAnError) {
  tree_.add("modes", 1);
  tree_.add("modes", std::string("2"), "text");
  tree_.add_empty("modes", "nothing");
  tree_.add("modes", 3);
  EXPECT_EQ(walk("modes", entry_kind_t::number),
            error("_get_generic_platform_list",
                  "Invalid platform configuration entry. Expected an integer. Entry name:text") +
                error("_get_generic_platform_list",
                      "Invalid platform configuration entry. Expected an integer. Entry name:nothing"));
  ASSERT_EQ(seen_.size(), 2U);
  EXPECT_EQ(seen_[1].number, 3);
}

TEST_F(ConfigurationList, EntryThatIsNoTextIsSkippedWithAnErrorAndAnEmptyLine) {
  tree_.add("modes", 16, "number");
  tree_.add("modes", std::string("4"));
  tree_.add_empty("modes", "nothing");
  EXPECT_EQ(walk("modes", entry_kind_t::text),
            error("_get_generic_platform_list",
                  "Invalid platform configuration entry. Expected a string. Entry name:number\n") +
                error("_get_generic_platform_list",
                      "Invalid platform configuration entry. Expected a string. Entry name:nothing\n"));
  ASSERT_EQ(seen_.size(), 1U);
  EXPECT_EQ(seen_[0].node_name, "entry_1");
}

TEST_F(ConfigurationList, NodeNameIsUsedWhateverTheStatusOfItsReading) {
  tree_.add("modes", 5, "named");
  tree_.answer(config_operation_t::node_get_name, 1);
  EXPECT_EQ(walk("modes", entry_kind_t::number), "");
  ASSERT_EQ(seen_.size(), 1U);
  EXPECT_EQ(seen_[0].node_name, "named");
}

TEST_F(ConfigurationList, NodesAreTraced) {
  tree_.add("modes", 1, "one");
  tree_.add("modes", 2, "two");
  EXPECT_EQ(traced_output_of([&] { read("modes", entry_kind_t::number); }),
            trace("print_platform_node", "\tRoot Node:Name of node is:modes") +
                trace("print_platform_node", "\tFirst Child Node:Name of node is:one") +
                trace("print_platform_node", "\tNext Node:Name of node is:one") +
                trace("print_platform_node", "\tNext Node:Name of node is:two"));
}

u32 node_of(const char *path) {
  u32 node = 0;
  EXPECT_EQ(config_node_find(0, path, &node), 0);
  return node;
}

TEST(PrintPlatformNode, TracesTheNodesName) {
  configuration_tree_t tree;
  tree.add_list("standard_timings");
  const u32 node = node_of((domain + "standard_timings").c_str());
  EXPECT_EQ(traced_output_of([&] { print_platform_node(node, "\tRoot Node"); }),
            trace("print_platform_node", "\tRoot Node:Name of node is:standard_timings"));
  EXPECT_EQ(tree.calls().back().operation, config_operation_t::node_get_name);
  EXPECT_EQ(tree.calls().back().handle, node);
  EXPECT_EQ(tree.calls().back().size, 256U);
}

TEST(PrintPlatformNode, TracesThatTheNameCouldNotBeRead) {
  configuration_tree_t tree;
  EXPECT_EQ(traced_output_of([] { print_platform_node(4711, "label"); }),
            trace("print_platform_node", "label:Failed trying to get name"));
  tree.answer(config_operation_t::node_get_name, 1);
  EXPECT_EQ(traced_output_of([] { print_platform_node(0, ""); }),
            trace("print_platform_node", ":Failed trying to get name"));
}

TEST(PrintPlatformNode, NeitherAsksNorPrintsWhileTracingIsOff) {
  const configuration_tree_t tree;
  EXPECT_EQ(output_of([] { print_platform_node(0, "label"); }), "");
  EXPECT_EQ(tree.lookups(), 0);
}

TEST(PrintPlatformNode, PrintsANameThatFillsTheBuffer) {
  configuration_tree_t tree;
  const std::string name(300, 'n');
  tree.add("list", 1, name);
  const u32 node = node_of((domain + "list." + name).c_str());
  EXPECT_EQ(traced_output_of([&] { print_platform_node(node, "label"); }),
            trace("print_platform_node", "label:Name of node is:" + name.substr(0, 255)));
}

}  // namespace

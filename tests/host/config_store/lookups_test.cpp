// The eight operations: what they deliver, and what they leave alone.
#include <array>
#include <cstring>

#include "config_store/store_fixture.h"

namespace host_test {
namespace {

constexpr const char *sample =
    "[edid]\nweek = 12\nname = \"Media Box\"\nempty = \"\"\nlist = [\"one\", 2]\nnone = []\n[edid.audio]\nmode = "
    "true\n";
constexpr u32 no_node = 1000000;

class ConfigLookup : public ConfigStore {
 protected:
  void SetUp() override { ASSERT_TRUE(load(sample)) << config_store_error(); }

  static u32 node_at(const char *path) {
    u32 node = 0;
    EXPECT_EQ(config_node_find(0, path, &node), 0) << path;
    return node;
  }
};

/// A buffer between bytes that nobody may write to, all 'x'.
struct guarded_buffer_t {
  std::array<char, 32> bytes;
  guarded_buffer_t() { bytes.fill('x'); }

  char *begin() { return bytes.data() + 8; }
  /// What stands from the buffer's begin to the end of the guard after it.
  std::string from_begin(std::size_t length) { return {begin(), length}; }
  bool is_untouched_outside(std::size_t size) {
    const std::string text(bytes.data(), bytes.size());
    return text.substr(0, 8) == std::string(8, 'x') &&
           text.substr(8 + size) == std::string(bytes.size() - 8 - size, 'x');
  }
};

TEST_F(ConfigLookup, ReadsAnInteger) {
  i32 value = 0;
  EXPECT_EQ(config_get_int(0, "edid.week", &value), 0);
  EXPECT_EQ(value, 12);
  value = 0;
  EXPECT_EQ(config_node_get_int(node_at("edid.week"), &value), 0);
  EXPECT_EQ(value, 12);
}

TEST_F(ConfigLookup, WhatIsNoIntegerLeavesTheValueAlone) {
  i32 value = 4711;
  for (const char *path : {"edid.name", "edid", "edid.list", "edid.nothing", "edid.week.below", "", "edid.", ".edid"}) {
    EXPECT_NE(config_get_int(0, path, &value), 0) << path;
  }
  EXPECT_NE(config_node_get_int(node_at("edid.name"), &value), 0);
  EXPECT_NE(config_node_get_int(node_at("edid.list"), &value), 0);
  EXPECT_NE(config_node_get_int(no_node, &value), 0);
  EXPECT_EQ(value, 4711);
}

TEST_F(ConfigLookup, WhatIsNoStringLeavesTheBufferAlone) {
  guarded_buffer_t buffer;
  for (const char *path : {"edid.week", "edid.audio.mode", "edid", "edid.list", "edid.nothing", ""}) {
    EXPECT_NE(config_get_str(0, path, buffer.begin(), 16), 0) << path;
  }
  EXPECT_NE(config_node_get_str(node_at("edid.week"), buffer.begin(), 16), 0);
  EXPECT_NE(config_node_get_str(no_node, buffer.begin(), 16), 0);
  EXPECT_NE(config_node_get_name(no_node, buffer.begin(), 16), 0);
  EXPECT_TRUE(buffer.is_untouched_outside(0));
}

TEST_F(ConfigLookup, AStringIsCopiedWithItsNulAndNothingBehindItIsTouched) {
  guarded_buffer_t buffer;
  EXPECT_EQ(config_get_str(0, "edid.name", buffer.begin(), 16), 0);
  EXPECT_EQ(buffer.from_begin(10), std::string("Media Box\0", 10));
  EXPECT_TRUE(buffer.is_untouched_outside(10));
}

TEST_F(ConfigLookup, AStringThatJustFitsIsCopiedWhole) {
  guarded_buffer_t buffer;
  EXPECT_EQ(config_get_str(0, "edid.name", buffer.begin(), 10), 0);
  EXPECT_EQ(buffer.from_begin(10), std::string("Media Box\0", 10));
  EXPECT_TRUE(buffer.is_untouched_outside(10));
}

TEST_F(ConfigLookup, ALongerStringIsCutAndEndsInItsNul) {
  guarded_buffer_t buffer;
  EXPECT_EQ(config_get_str(0, "edid.name", buffer.begin(), 9), 0);
  EXPECT_EQ(buffer.from_begin(9), std::string("Media Bo\0", 9));
  EXPECT_TRUE(buffer.is_untouched_outside(9));
}

TEST_F(ConfigLookup, ABufferOfOneByteGetsTheNul) {
  guarded_buffer_t buffer;
  EXPECT_EQ(config_get_str(0, "edid.name", buffer.begin(), 1), 0);
  EXPECT_EQ(*buffer.begin(), '\0');
  EXPECT_TRUE(buffer.is_untouched_outside(1));
}

TEST_F(ConfigLookup, ABufferOfNoBytesStaysUntouched) {
  guarded_buffer_t buffer;
  EXPECT_EQ(config_get_str(0, "edid.name", buffer.begin(), 0), 0);
  EXPECT_EQ(config_node_get_str(node_at("edid.name"), buffer.begin(), 0), 0);
  EXPECT_EQ(config_node_get_name(node_at("edid.name"), buffer.begin(), 0), 0);
  EXPECT_EQ(config_get_str(0, "edid.name", nullptr, 0), 0);
  EXPECT_TRUE(buffer.is_untouched_outside(0));
}

TEST_F(ConfigLookup, AnEmptyStringIsAString) {
  guarded_buffer_t buffer;
  EXPECT_EQ(config_get_str(0, "edid.empty", buffer.begin(), 16), 0);
  EXPECT_EQ(*buffer.begin(), '\0');
  EXPECT_TRUE(buffer.is_untouched_outside(1));
}

TEST_F(ConfigLookup, NodeStringsAndNamesAreCutLikeStrings) {
  guarded_buffer_t text;
  EXPECT_EQ(config_node_get_str(node_at("edid.name"), text.begin(), 6), 0);
  EXPECT_EQ(text.from_begin(6), std::string("Media\0", 6));
  EXPECT_TRUE(text.is_untouched_outside(6));
  guarded_buffer_t name;
  EXPECT_EQ(config_node_get_name(node_at("edid.audio"), name.begin(), 4), 0);
  EXPECT_EQ(name.from_begin(4), std::string("aud\0", 4));
  EXPECT_TRUE(name.is_untouched_outside(4));
}

TEST_F(ConfigLookup, ANameIsTheLastComponentOfThePath) {
  char name[16] = "";
  EXPECT_EQ(config_node_get_name(node_at("edid.audio.mode"), name, sizeof name), 0);
  EXPECT_STREQ(name, "mode");
  EXPECT_EQ(config_node_get_name(node_at("edid.list.1"), name, sizeof name), 0);
  EXPECT_STREQ(name, "1");
}

TEST_F(ConfigLookup, FindsBranchesAndValuesAndTellsWhatIsNotThere) {
  u32 node = 4711;
  for (const char *path : {"nothing", "edid.wee", "edid.weekly", "edid.week.", ".edid.week", "edid..week", "EDID"}) {
    EXPECT_EQ(config_node_find(0, path, &node), 2) << path;
  }
  EXPECT_EQ(node, 4711U);
  for (const char *path : {"edid", "edid.week", "edid.audio", "edid.list", "edid.list.0", "edid.none"}) {
    EXPECT_EQ(config_node_find(0, path, &node), 0) << path;
  }
}

TEST_F(ConfigLookup, WalksChildrenToTheLast) {
  u32 child = 0;
  ASSERT_EQ(config_node_first_child(node_at("edid.list"), &child), 0);
  EXPECT_EQ(child, node_at("edid.list.0"));
  ASSERT_EQ(config_node_next_sibling(child, &child), 0);
  EXPECT_EQ(child, node_at("edid.list.1"));
  EXPECT_NE(config_node_next_sibling(child, &child), 0);
  EXPECT_EQ(child, node_at("edid.list.1"));
}

TEST_F(ConfigLookup, AnEmptyListAndAValueHaveNoChildren) {
  u32 child = 4711;
  EXPECT_EQ(config_node_first_child(node_at("edid.none"), &child), 2);
  EXPECT_EQ(config_node_first_child(node_at("edid.week"), &child), 2);
  EXPECT_EQ(config_node_first_child(no_node, &child), 2);
  EXPECT_NE(config_node_next_sibling(no_node, &child), 0);
  EXPECT_EQ(child, 4711U);
}

TEST_F(ConfigLookup, OnlyTheRootIsARoot) {
  i32 value = 0;
  u32 node = 0;
  char text[16] = "";
  EXPECT_NE(config_get_int(1, "edid.week", &value), 0);
  EXPECT_NE(config_get_str(1, "edid.name", text, sizeof text), 0);
  EXPECT_EQ(config_node_find(1, "edid", &node), 2);
}

TEST_F(ConfigLookup, MissingArgumentsAreNotFound) {
  i32 value = 0;
  u32 node = 0;
  char text[16] = "";
  EXPECT_NE(config_get_int(0, nullptr, &value), 0);
  EXPECT_NE(config_get_int(0, "edid.week", nullptr), 0);
  EXPECT_NE(config_get_str(0, nullptr, text, sizeof text), 0);
  EXPECT_NE(config_get_str(0, "edid.name", nullptr, 16), 0);
  EXPECT_EQ(config_node_find(0, nullptr, &node), 2);
  EXPECT_EQ(config_node_find(0, "edid", nullptr), 2);
}

}  // namespace
}  // namespace host_test

// Where nodes stand in their document.
#include "config_store/store_fixture.h"

namespace host_test {
namespace {

class NodePosition : public ConfigStore {
 protected:
  /// "line:column" of the node at a path.
  static std::string position_at(const char *path) {
    u32 node = 0;
    unsigned line = 0;
    unsigned column = 0;
    EXPECT_EQ(config_node_find(0, path, &node), 0) << path;
    EXPECT_TRUE(config_store_node_position(node, &line, &column)) << path;
    return std::to_string(line) + ":" + std::to_string(column);
  }
};

TEST_F(NodePosition, OfAKeyIsWhereTheKeyBegins) {
  ASSERT_TRUE(load("# comment\nweek = 1\n  \"name\" = \"Box\"\non = true\ninline = { one = 1, two = 2 }\n"));
  EXPECT_EQ(position_at("week"), "2:1");
  EXPECT_EQ(position_at("name"), "3:3");
  EXPECT_EQ(position_at("on"), "4:1");
  EXPECT_EQ(position_at("inline"), "5:1");
  EXPECT_EQ(position_at("inline.two"), "5:21");
}

TEST_F(NodePosition, OfAnElementIsWhereItsValueBegins) {
  ASSERT_TRUE(load("list = [\"one\", 2,\n  [3], true]\n"));
  EXPECT_EQ(position_at("list"), "1:1");
  EXPECT_EQ(position_at("list.0"), "1:9");
  EXPECT_EQ(position_at("list.1"), "1:16");
  EXPECT_EQ(position_at("list.2"), "2:3");
  EXPECT_EQ(position_at("list.2.0"), "2:4");
  EXPECT_EQ(position_at("list.3"), "2:8");
}

TEST_F(NodePosition, OfATableIsItsNameInTheHeading) {
  ASSERT_TRUE(load("\n[platform.edid]\nweek = 1\n"));
  EXPECT_EQ(position_at("platform"), "2:2");
  EXPECT_EQ(position_at("platform.edid"), "2:11");
}

TEST_F(NodePosition, ThatIsNoneLeavesTheOutputAlone) {
  ASSERT_TRUE(load("week = 1\n"));
  unsigned line = 77;
  unsigned column = 78;
  EXPECT_FALSE(config_store_node_position(0, &line, &column));
  EXPECT_FALSE(config_store_node_position(1000000, &line, &column));
  EXPECT_EQ(line, 77U);
  EXPECT_EQ(column, 78U);
}

TEST_F(NodePosition, MayBeAskedForInPart) {
  ASSERT_TRUE(load("\n week = 1\n"));
  u32 node = 0;
  ASSERT_EQ(config_node_find(0, "week", &node), 0);
  unsigned line = 0;
  unsigned column = 0;
  EXPECT_TRUE(config_store_node_position(node, &line, nullptr));
  EXPECT_TRUE(config_store_node_position(node, nullptr, &column));
  EXPECT_EQ(line, 2U);
  EXPECT_EQ(column, 2U);
}

}  // namespace
}  // namespace host_test

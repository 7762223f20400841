// What a document becomes in the tree.
#include "config_store/store_fixture.h"
#include "support/temporary_directory.h"

namespace host_test {
namespace {

using names_t = std::vector<std::string>;

TEST_F(ConfigStore, EmptyDocumentIsAnEmptyTree) {
  EXPECT_EQ(children_of(""), names_t{});
  EXPECT_STREQ(config_store_error(), "");
}

TEST_F(ConfigStore, IntegersAreReadInEveryNotation) {
  ASSERT_TRUE(load("a = 60\nb = -7\nc = 0x7FF\nd = 0b101\ne = 0o17\nf = 1_000\n"));
  EXPECT_EQ(integer_at("a"), 60);
  EXPECT_EQ(integer_at("b"), -7);
  EXPECT_EQ(integer_at("c"), 0x7FF);
  EXPECT_EQ(integer_at("d"), 5);
  EXPECT_EQ(integer_at("e"), 15);
  EXPECT_EQ(integer_at("f"), 1000);
}

TEST_F(ConfigStore, IntegersReachFromTheSmallestSignedToTheLargestUnsignedOne) {
  ASSERT_TRUE(load("low = -2147483648\nhigh = 2147483647\nbeyond = 2147483648\nserial = 0xFFFFFFFF\n"));
  EXPECT_EQ(integer_at("low"), INT32_MIN);
  EXPECT_EQ(integer_at("high"), INT32_MAX);
  EXPECT_EQ(static_cast<u32>(integer_at("beyond").value()), 0x80000000U);
  EXPECT_EQ(static_cast<u32>(integer_at("serial").value()), 0xFFFFFFFFU);
}

TEST_F(ConfigStore, BooleansReadAsZeroAndOne) {
  ASSERT_TRUE(load("off = false\non = true\n"));
  EXPECT_EQ(integer_at("off"), 0);
  EXPECT_EQ(integer_at("on"), 1);
}

TEST_F(ConfigStore, StringsAreReadInEveryNotation) {
  ASSERT_TRUE(
      load("a = \"Media Box\"\nb = 'back\\slash'\nc = \"\"\nd = \"tab\\tB\\u00F6x\"\ne = \"\"\"two\nlines\"\"\"\n"));
  EXPECT_EQ(text_at("a"), "Media Box");
  EXPECT_EQ(text_at("b"), "back\\slash");
  EXPECT_EQ(text_at("c"), "");
  EXPECT_EQ(text_at("d"), "tab\tB\xC3\xB6x");
  EXPECT_EQ(text_at("e"), "two\nlines");
}

TEST_F(ConfigStore, TablesMakePathsHoweverTheyAreWritten) {
  ASSERT_TRUE(load("top = 1\n[a.b]\nc = 2\nd.e = 3\nf = { g = 4 }\n"));
  EXPECT_EQ(integer_at("top"), 1);
  EXPECT_EQ(integer_at("a.b.c"), 2);
  EXPECT_EQ(integer_at("a.b.d.e"), 3);
  EXPECT_EQ(integer_at("a.b.f.g"), 4);
}

TEST_F(ConfigStore, ChildrenOfATableStandInTheOrderOfTheFile) {
  ASSERT_TRUE(load("[list]\nzebra = 1\napple = 2\nmango = 3\n\"10\" = 4\n9 = 5\n"));
  EXPECT_EQ(children_of("list"), (names_t{"zebra", "apple", "mango", "10", "9"}));
}

TEST_F(ConfigStore, ChildrenOfAnInlineTableStandInTheOrderOfTheLine) {
  ASSERT_TRUE(load("list = { zebra = 1, apple = 2, mango = 3 }\n"));
  EXPECT_EQ(children_of("list"), (names_t{"zebra", "apple", "mango"}));
}

TEST_F(ConfigStore, ATableStandsWhereTheFileFirstNamesIt) {
  ASSERT_TRUE(load("[z.second]\nx = 1\n[m]\nx = 1\n[z.first]\nx = 1\n[a]\nx = 1\n"));
  EXPECT_EQ(children_of(""), (names_t{"z", "m", "a"}));
  EXPECT_EQ(children_of("z"), (names_t{"second", "first"}));
}

TEST_F(ConfigStore, ElementsOfAnArrayAreNamedByTheirIndex) {
  ASSERT_TRUE(load("list = [\"16 FP\", \"4\", 7, true, [8, 9], { x = 10 }]\n"));
  EXPECT_EQ(children_of("list"), (names_t{"0", "1", "2", "3", "4", "5"}));
  EXPECT_EQ(text_at("list.0"), "16 FP");
  EXPECT_EQ(integer_at("list.2"), 7);
  EXPECT_EQ(integer_at("list.3"), 1);
  EXPECT_EQ(integer_at("list.4.1"), 9);
  EXPECT_EQ(integer_at("list.5.x"), 10);
}

TEST_F(ConfigStore, ElementsOfALongArrayStandInTheirOrder) {
  ASSERT_TRUE(load("list = [1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12]\n"));
  EXPECT_EQ(children_of("list"), (names_t{"0", "1", "2", "3", "4", "5", "6", "7", "8", "9", "10", "11"}));
  EXPECT_EQ(integer_at("list.11"), 12);
}

TEST_F(ConfigStore, TablesInAnArrayAreItsElements) {
  ASSERT_TRUE(load("[[list]]\nx = 1\n[[list]]\nx = 2\n"));
  EXPECT_EQ(children_of("list"), (names_t{"0", "1"}));
  EXPECT_EQ(integer_at("list.1.x"), 2);
}

TEST_F(ConfigStore, EmptyArraysAndTablesAreNodesWithoutChildren) {
  ASSERT_TRUE(load("list = []\n[table]\n"));
  u32 node = 0;
  EXPECT_EQ(config_node_find(0, "list", &node), 0);
  EXPECT_EQ(config_node_find(0, "table", &node), 0);
  EXPECT_EQ(children_of("list"), names_t{});
  EXPECT_EQ(children_of("table"), names_t{});
}

TEST_F(ConfigStore, KeysMayBeginWithADigit) {
  ASSERT_TRUE(
      load("[platform.software.drivers.vorex.edid]\n60_hz_priority_list = [\"16\"]\n4k_x_2k_priority_list = [1]\n"));
  EXPECT_EQ(text_at("platform.software.drivers.vorex.edid.60_hz_priority_list.0"), "16");
  EXPECT_EQ(integer_at("platform.software.drivers.vorex.edid.4k_x_2k_priority_list.0"), 1);
}

TEST_F(ConfigStore, EveryOneOfManyKeysIsFound) {
  std::string document = "[many]\n";
  for (int index = 0; index < 20000; ++index) {
    document += "key_" + std::to_string(index) + " = " + std::to_string(index) + "\n";
  }
  ASSERT_TRUE(load(document)) << config_store_error();
  for (int index = 0; index < 20000; ++index) {
    ASSERT_EQ(integer_at("many.key_" + std::to_string(index)), index);
  }
  EXPECT_EQ(integer_at("many.key_20000"), std::nullopt);
}

TEST_F(ConfigStore, AFileIsLoadedLikeAText) {
  const temporary_directory_t directory;
  const std::string file = directory.write("box.toml", "[edid]\nweek = 12\n");
  ASSERT_TRUE(config_store_load_file(file.c_str())) << config_store_error();
  EXPECT_EQ(integer_at("edid.week"), 12);
  EXPECT_STREQ(config_store_error(), "");
}

TEST_F(ConfigStore, ALoadReplacesTheWholeTree) {
  ASSERT_TRUE(load("old = 1\nboth = 1\n"));
  ASSERT_TRUE(load("new = 2\nboth = 2\n"));
  EXPECT_EQ(children_of(""), (names_t{"new", "both"}));
  EXPECT_EQ(integer_at("old"), std::nullopt);
  EXPECT_EQ(integer_at("both"), 2);
}

TEST_F(ConfigStore, OnlyTheGivenLengthOfATextIsRead) {
  const std::string document = "a = 1\nb = 2\n";
  ASSERT_TRUE(config_store_load_text(document.data(), 6, document_name));
  EXPECT_EQ(children_of(""), names_t{"a"});
}

}  // namespace
}  // namespace host_test

// What is refused, with which error, and that nothing of it arrives.
#include <pthread.h>
#include "config_store/store_fixture.h"

#include <functional>

#include "support/temporary_directory.h"

namespace host_test {
namespace {

struct refusal_case_t {
  const char *name;
  std::string document;
  std::string error;
};

void PrintTo(const refusal_case_t &tested, std::ostream *stream) {
  *stream << tested.name;
}

std::string nested_tables(int depth) {
  std::string document = "[t";
  for (int level = 1; level < depth; ++level) {
    document += ".t";
  }
  return document + "]\n";
}

std::string repeated(const std::string &text, int times) {
  std::string result;
  for (int count = 0; count < times; ++count) {
    result += text;
  }
  return result;
}

const std::string only_these = " cannot be stored; use an integer, a string, a boolean, an array or a table";

class ConfigRefusal : public ConfigStore, public testing::WithParamInterface<refusal_case_t> {};

TEST_P(ConfigRefusal, NamesLineColumnAndKey) {
  EXPECT_EQ(refusal_of(GetParam().document), GetParam().error);
}

INSTANTIATE_TEST_SUITE_P(
    Values, ConfigRefusal,
    testing::Values(
        refusal_case_t{"Float", "a = 1.5\n", "test.toml:1:5: a: a floating-point number" + only_these},
        refusal_case_t{"NotANumber", "\na = nan\n", "test.toml:2:5: a: a floating-point number" + only_these},
        refusal_case_t{"Date", "[x]\nday = 2024-02-29\n", "test.toml:2:7: x.day: a date" + only_these},
        refusal_case_t{"Time", "[x]\nat = 07:30:00\n", "test.toml:2:6: x.at: a time" + only_these},
        refusal_case_t{"DateAndTime", "at = 2024-02-29T07:30:00Z\n", "test.toml:1:6: at: a date and time" + only_these},
        refusal_case_t{"FloatInAList", "[x]\nlist = [1, 2.5]\n",
                       "test.toml:2:12: x.list.1: a floating-point number" + only_these},
        refusal_case_t{"TooLarge", "[x.y]\nserial = 4294967296\n",
                       "test.toml:2:10: x.y.serial: 4294967296 does not fit 32 bits (-2147483648 to 4294967295)"},
        refusal_case_t{"TooSmall", "a = -2147483649\n",
                       "test.toml:1:5: a: -2147483649 does not fit 32 bits (-2147483648 to 4294967295)"},
        refusal_case_t{"NulInAString", "a = \"x\\u0000y\"\n", "test.toml:1:5: a: the string holds a NUL character"}),
    [](const auto &tested) { return tested.param.name; });

INSTANTIATE_TEST_SUITE_P(
    Keys, ConfigRefusal,
    testing::Values(
        refusal_case_t{"Empty", "[x]\n\"\" = 1\n", "test.toml:2:1: x.: an empty key cannot be looked up"},
        refusal_case_t{
            "WithADot", "[x]\n\"audio.mode\" = 1\n",
            "test.toml:2:1: x.audio.mode: a key with a dot in it cannot be looked up, since dots separate the "
            "names of a path"},
        refusal_case_t{"WithAControlCharacter", "\"a\\nb\" = 1\n",
                       "test.toml:1:1: a\\nb: a key with a control character in it cannot be looked up"},
        refusal_case_t{"PathTooLong", repeated("a", 256) + " = 1\n",
                       "test.toml:1:1: " + repeated("a", 256) + ": the path is longer than 255 characters"},
        refusal_case_t{"NestedTooDeep", nested_tables(65),
                       "test.toml:1:129: tables and arrays are nested more than 64 deep"},
        refusal_case_t{"WithoutEnd", "\na" + repeated(".a", 100000) + " = 1\n",
                       "test.toml:2:130: tables and arrays are nested more than 64 deep"},
        refusal_case_t{"ListTooLong", "[x]\nlist = [" + repeated("1,", 1001) + "]\n",
                       "test.toml:2:1: x.list: a list of 1001 entries, which has 1000 at most"}),
    [](const auto &tested) { return tested.param.name; });

TEST_F(ConfigStore, TheDeepestNestingAndTheLongestPathAreAccepted) {
  EXPECT_TRUE(load(nested_tables(64))) << config_store_error();
  EXPECT_TRUE(load(repeated("a", 255) + " = 1\n")) << config_store_error();
  EXPECT_EQ(integer_at(repeated("a", 255)), 1);
}

TEST_F(ConfigStore, TheLongestListIsAccepted) {
  EXPECT_TRUE(load("list = [" + repeated("1,", 1000) + "]\n")) << config_store_error();
}

/// Runs an action on a stack of a mebibyte, as threads of small systems have it.
void with_small_stack(const std::function<void()> &action) {
  pthread_attr_t attributes;
  ASSERT_EQ(pthread_attr_init(&attributes), 0);
  ASSERT_EQ(pthread_attr_setstacksize(&attributes, 1024UL * 1024UL), 0);
  pthread_t thread{};
  const auto run = [](void *passed) -> void * {
    (*static_cast<const std::function<void()> *>(passed))();
    return nullptr;
  };
  ASSERT_EQ(pthread_create(&thread, &attributes, run, const_cast<std::function<void()> *>(&action)), 0);
  ASSERT_EQ(pthread_join(thread, nullptr), 0);
  pthread_attr_destroy(&attributes);
}

TEST_F(ConfigStore, NestingDoesNotExhaustASmallStack) {
  const std::string dots = repeated(".a", 40);
  const std::vector<std::string> documents = {
      "a = " + repeated("[", 300000),
      "a = " + repeated("[", 60) + repeated("]", 60) + "\n",
      "a = " + repeated("{a=", 200000),
      repeated("[a" + dots + "]\na" + dots + " = 1\n", 10),
      "a = " + repeated("[\n{ a" + dots + " = ", 5000),
      "a = [" + repeated("[[\"[\", '[', # [\n", 100000),
      repeated("[", 300000),
      "a" + repeated("\n.a", 200000),
  };
  for (const std::string &document : documents) {
    with_small_stack([&] { load(document); });
  }
  EXPECT_EQ(refusal_of("x = 1\n[t" + repeated(".t", 30) + "]\na" + repeated(".a", 40) + " = 1\n"),
            "test.toml:3:68: tables and arrays are nested more than 64 deep");
}

TEST_F(ConfigStore, CharactersOutsideOfAsciiBelongIntoStringsAndComments) {
  const std::string beyond = "a character that is not ASCII is outside of strings and comments";
  EXPECT_EQ(refusal_of("a = 1\nb = \xEF\xBB\x9A\n"), "test.toml:2:5: " + beyond);
  EXPECT_EQ(refusal_of("\xC3\xA4 = 1\n"), "test.toml:1:1: " + beyond);
  EXPECT_EQ(refusal_of("a = '\xC3\xA4' \xC3\xA4\n"), "test.toml:1:9: " + beyond);
  EXPECT_EQ(refusal_of("a = \"\"\"x\n\"\"\"\"\"\xC3\xA4\n"), "test.toml:2:6: " + beyond);
  EXPECT_TRUE(load("\xEF\xBB\xBF# \xC3\xA4\na = \"\xC3\xA4\\\"\xC3\xA4\"\nb = '''\n\xEF\xBB\x9A'''\n'\xC3\xA4' = 1\n"))
      << config_store_error();
  EXPECT_EQ(text_at("a"), "\xC3\xA4\"\xC3\xA4");
}

/// The parser looks some of these up beyond the end of its table.
TEST_F(ConfigStore, EachCharacterThatTheParserHasNoPlaceForIsRefusedOutsideOfStrings) {
  for (unsigned code = 0xFED0; code <= 0xFEFE; ++code) {
    const std::string character = {static_cast<char>(0xE0 | code >> 12), static_cast<char>(0x80 | (code >> 6 & 0x3F)),
                                   static_cast<char>(0x80 | (code & 0x3F))};
    for (const std::string &document : {character, "a = " + character, "a = [" + character, "[" + character + "]"}) {
      EXPECT_NE(refusal_of(document).find("that is not ASCII"), std::string::npos) << code;
    }
    EXPECT_TRUE(load("a = \"" + character + "\" # " + character + "\n")) << config_store_error();
  }
}

struct malformed_case_t {
  const char *name;
  std::string document;
  std::string position;  ///< How the error begins.
};

void PrintTo(const malformed_case_t &tested, std::ostream *stream) {
  *stream << tested.name;
}

class MalformedDocument : public ConfigStore, public testing::WithParamInterface<malformed_case_t> {};

TEST_P(MalformedDocument, IsRefusedInOneLineThatBeginsWithThePosition) {
  const std::string error = refusal_of(GetParam().document);
  EXPECT_EQ(error.substr(0, GetParam().position.size()), GetParam().position);
  EXPECT_GT(error.size(), GetParam().position.size());
  EXPECT_EQ(error.find('\n'), std::string::npos) << error;
}

INSTANTIATE_TEST_SUITE_P(
    Documents, MalformedDocument,
    testing::Values(malformed_case_t{"TwoValues", "a = 1\nb = 5 5\n", "test.toml:2:7: "},
                    malformed_case_t{"DuplicateKey", "a = 1\na = 2\n", "test.toml:2:"},
                    malformed_case_t{"UnclosedString", "a = \"x\n", "test.toml:1:"},
                    malformed_case_t{"UnclosedTable", "[a\n", "test.toml:1:"},
                    malformed_case_t{"UnclosedArray", "a = [1,\n", "test.toml:1:"},
                    malformed_case_t{"MissingValue", "a =\n", "test.toml:1:"},
                    malformed_case_t{"NumberBeyond64Bits", "a = 99999999999999999999\n", "test.toml:1:"},
                    malformed_case_t{"WrongWord", "a = tru\n", "test.toml:1:"},
                    malformed_case_t{"InvalidUtf8", "a = \"\xFF\"\n", "test.toml:1:"},
                    malformed_case_t{"NulByte", std::string("a = 1\n\0b = 2\n", 13), "test.toml:2:"}),
    [](const auto &tested) { return tested.param.name; });

TEST_F(ConfigStore, WhatTheParserTakesForGrantedIsRefusedLikeAnyMistake) {
  EXPECT_EQ(
      refusal_of("[=x]\n"),
      "test.toml:1:2: Error while parsing key: expected bare key starting character or string delimiter, saw '='");
  EXPECT_EQ(refusal_of("[[=x]]\n").substr(0, 10), "test.toml:");
  EXPECT_EQ(refusal_of("a = { =1 }\n").substr(0, 10), "test.toml:");
}

TEST_F(ConfigStore, AFailedLoadLeavesTheTreeAsItWas) {
  ASSERT_TRUE(load("keep = 1\n[list]\nb = 1\na = 2\n"));
  u32 node = 0;
  ASSERT_EQ(config_node_find(0, "list", &node), 0);
  EXPECT_NE(refusal_of("keep = 2\nbad = 1.5\n"), "");
  EXPECT_NE(refusal_of("keep = 3\nbad =\n"), "");
  EXPECT_FALSE(config_store_load_file("/nonexistent/platform.toml"));
  EXPECT_EQ(integer_at("keep"), 1);
  EXPECT_EQ(integer_at("bad"), std::nullopt);
  u32 same_node = 0;
  EXPECT_EQ(config_node_find(0, "list", &same_node), 0);
  EXPECT_EQ(same_node, node);
  EXPECT_EQ(children_of("list"), (std::vector<std::string>{"b", "a"}));
}

TEST_F(ConfigStore, ASuccessfulLoadClearsTheError) {
  EXPECT_NE(refusal_of("a =\n"), "");
  EXPECT_TRUE(load("a = 1\n"));
  EXPECT_STREQ(config_store_error(), "");
}

TEST_F(ConfigStore, AMissingFileIsRefused) {
  EXPECT_FALSE(config_store_load_file("/nonexistent/platform.toml"));
  EXPECT_STREQ(config_store_error(), "/nonexistent/platform.toml: No such file or directory");
}

TEST_F(ConfigStore, ADirectoryIsRefused) {
  const temporary_directory_t directory;
  const std::string path = directory.path("");
  EXPECT_FALSE(config_store_load_file(path.c_str()));
  EXPECT_EQ(config_store_error(), path + ": Is a directory");
}

TEST_F(ConfigStore, AMalformedFileIsCalledByItsName) {
  const temporary_directory_t directory;
  const std::string file = directory.write("box.toml", "[edid]\nweek = 1.5\n");
  EXPECT_FALSE(config_store_load_file(file.c_str()));
  EXPECT_EQ(config_store_error(), file + ":2:8: edid.week: a floating-point number" + only_these);
}

TEST_F(ConfigStore, ADocumentOfMoreThanOneMebibyteIsRefused) {
  const std::string comments = repeated("# " + std::string(61, '-') + "\n", 16384);
  ASSERT_EQ(comments.size(), 1024U * 1024U);
  EXPECT_TRUE(load(comments)) << config_store_error();
  EXPECT_EQ(refusal_of(comments + "\n"), "test.toml: larger than 1 MiB");
}

TEST_F(ConfigStore, AFileWithoutEndIsRefused) {
  EXPECT_FALSE(config_store_load_file("/dev/zero"));
  EXPECT_STREQ(config_store_error(), "/dev/zero: larger than 1 MiB");
}

TEST_F(ConfigStore, MissingArgumentsAreRefused) {
  EXPECT_FALSE(config_store_load_file(nullptr));
  EXPECT_STREQ(config_store_error(), "no file name given");
  EXPECT_FALSE(config_store_load_text(nullptr, 0, document_name));
  EXPECT_STREQ(config_store_error(), "no text or no name given");
  EXPECT_FALSE(config_store_load_text("", 0, nullptr));
  EXPECT_STREQ(config_store_error(), "no text or no name given");
}

}  // namespace
}  // namespace host_test

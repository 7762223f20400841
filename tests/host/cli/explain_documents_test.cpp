// Texts of any bytes in JSON, in HTML and on a terminal, and tables.
#include <gmock/gmock.h>

#include "explain/explanation_json.h"
#include "text/printable_text.h"
#include "text/text_table.h"
#include "text/utf8_text.h"

namespace edid_cli {
namespace {

using testing::HasSubstr;

constexpr const char *replaced = "\xEF\xBF\xBD";

TEST(Utf8, KeepsWhatIsValid) {
  for (const char *text : {"", "plain", "na\xC3\xAFve", "\xE2\x82\xAC", "\xF0\x9F\x98\x80", "\xF4\x8F\xBF\xBF"}) {
    EXPECT_EQ(valid_utf8(text), text);
  }
}

TEST(Utf8, ReplacesEachByteThatIsNot) {
  const struct {
    const char *text;
    int bytes;
  } cases[] = {
      {"\x80", 1},              // A continuation.
      {"\xC3", 1},              // Cut short.
      {"\xC0\xAF", 2},          // Longer than it needs to be.
      {"\xE0\x80\x80", 3},      // The same.
      {"\xED\xA0\x80", 3},      // Half of a UTF-16 pair.
      {"\xF4\x90\x80\x80", 4},  // Above the last character.
      {"\xFF\xFE", 2},          // Never part of one.
  };
  for (const auto &invalid : cases) {
    std::string expected = "a";
    for (int byte = 0; byte < invalid.bytes; ++byte) {
      expected += replaced;
    }
    EXPECT_EQ(valid_utf8(std::string("a") + invalid.text + "b"), expected + "b");
  }
}

TEST(HtmlText, EscapesWhatMeansSomething) {
  EXPECT_EQ(html_text("<script>\"a\" & 'b'"), "&lt;script&gt;&quot;a&quot; &amp; &#39;b&#39;");
  EXPECT_EQ(html_text("&lt;"), "&amp;lt;");
}

TEST(HtmlText, HasNoControlCharacters) {
  for (int character = 0; character < 0x20; ++character) {
    EXPECT_EQ(html_text(std::string(1, static_cast<char>(character))), replaced);
  }
  EXPECT_EQ(html_text("\x7F"), replaced);
}

step_t step(const std::string &text, const std::string &key, unsigned line) {
  return {.action = step_action_t::set_key, .key = key, .value = "1", .line = line, .text = text};
}

answer_t answer(const std::string &name, const std::vector<steps_t> &ways) {
  return {.name = name, .is_offered = ways.empty(), .reasons = {"So."}, .ways = ways, .no_way = ""};
}

TEST(AnswerJson, IsADocumentOfWhatIsWantedAndEachAnswer) {
  const answers_t answers{{"Block 2."},
                          {answer("A", {}), answer("B", {{step("set k = 1", "k", 7)}, {step("set l = 1", "l", 0)}})}};
  EXPECT_EQ(answer_json("16", answers), R"({
  "version": 1,
  "want": "16",
  "sink_gaps": [
    "Block 2."
  ],
  "answers": [
    {
      "name": "A",
      "offered": true,
      "reasons": [
        "So."
      ],
      "steps": [],
      "other_ways": [],
      "no_way": null
    },
    {
      "name": "B",
      "offered": false,
      "reasons": [
        "So."
      ],
      "steps": [
        {
          "text": "set k = 1",
          "action": "set",
          "key": "k",
          "value": "1",
          "line": 7
        }
      ],
      "other_ways": [
        [
          {
            "text": "set l = 1",
            "action": "set",
            "key": "l",
            "value": "1"
          }
        ]
      ],
      "no_way": null
    }
  ]
}
)");
}

TEST(AnswerJson, TakesTextsOfAnyBytes) {
  answer_t hostile = answer(std::string("a\"b\\c\0\n\x1F", 8), {{step("<\xE9>", "\xC3\xA9", 0)}});
  hostile.reasons = {"\xF0\x9F\x98"};
  const std::string json = answer_json("\xFF", {{}, {hostile}});
  EXPECT_THAT(json, HasSubstr(R"("name": "a\"b\\c\u0000\n\u001f")"));
  EXPECT_THAT(json, HasSubstr(std::string("\"want\": \"") + replaced + "\""));
  EXPECT_THAT(json, HasSubstr(std::string("\"") + replaced + replaced + replaced + "\""));
  EXPECT_THAT(json, HasSubstr(std::string("\"<") + replaced + ">\""));
  EXPECT_THAT(json, HasSubstr("\"key\": \"\xC3\xA9\""));
}

TEST(Printable, HasNoControlCharacters) {
  EXPECT_EQ(printable("a\tb\nc\x1B[31m\x7F"), "a?b?c?[31m?");
  EXPECT_EQ(printable("na\xC3\xAFve \xE2\x82\xAC"), "na\xC3\xAFve \xE2\x82\xAC");
  // U+0080 to U+009F, which some terminals obey, and a byte of them alone.
  EXPECT_EQ(printable("\xC2\x80\xC2\x9B\xC2\x9F\xC2\xA0"), "???\xC2\xA0");
  EXPECT_EQ(printable("a\x9Bz\xFF"), "a?z?");
  EXPECT_EQ(printable_lines("a\tb\n\x1B\n"), "a\tb\n?\n");
}

TEST(TextTable, GoesOnInFurtherLinesWhereItIsTooWide) {
  text_table_t table;
  table.add({"A", "one two three four five six seven"});
  table.add({"BB", "one"});
  EXPECT_EQ(table.text(), "A   one two three four five six seven\nBB  one\n");
  EXPECT_EQ(table.text(26), "A   one two three four\n    five six seven\nBB  one\n");
}

}  // namespace
}  // namespace edid_cli

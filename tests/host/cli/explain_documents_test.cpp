// Texts of any bytes in JSON and in HTML.
#include <gmock/gmock.h>

#include "explain/explanation_json.h"
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

TEST(AnswerJson, IsADocumentOfWhatIsWantedAndEachAnswer) {
  const answer_t offered{"1920x1080p60", true, {"It is there."}, {}};
  const answer_t missing{"AC3", false, {}, {{"add entry_b", "audio.entry_b", 7}, {"give --audio-mask 0x2", "x"}}};
  EXPECT_EQ(answer_json("16", {offered, missing}), R"({
  "version": 1,
  "want": "16",
  "answers": [
    {
      "name": "1920x1080p60",
      "offered": true,
      "reasons": [
        "It is there."
      ],
      "steps": []
    },
    {
      "name": "AC3",
      "offered": false,
      "reasons": [],
      "steps": [
        {
          "text": "add entry_b",
          "key": "audio.entry_b",
          "line": 7
        },
        {
          "text": "give --audio-mask 0x2",
          "key": "x"
        }
      ]
    }
  ]
}
)");
}

TEST(AnswerJson, TakesTextsOfAnyBytes) {
  const answer_t answer{std::string("a\"b\\c\0\n\x1F", 8), false, {"\xF0\x9F\x98"}, {{"<\xE9>", "\xC3\xA9"}}};
  const std::string json = answer_json("\xFF", {answer});
  EXPECT_THAT(json, HasSubstr(R"("name": "a\"b\\c\u0000\n\u001f")"));
  EXPECT_THAT(json, HasSubstr(std::string("\"want\": \"") + replaced + "\""));
  EXPECT_THAT(json, HasSubstr(std::string("\"") + replaced + replaced + replaced + "\""));
  EXPECT_THAT(json, HasSubstr(std::string("\"<") + replaced + ">\""));
  EXPECT_THAT(json, HasSubstr("\"key\": \"\xC3\xA9\""));
}

}  // namespace
}  // namespace edid_cli

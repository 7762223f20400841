// Texts of any bytes in JSON and in HTML.
#include <gmock/gmock.h>

#include "explain/json_writer.h"
#include "explain/utf8_text.h"

namespace edid_cli {
namespace {

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

TEST(JsonText, EscapesQuotesBackslashesAndControlCharacters) {
  EXPECT_EQ(json_text("a\"b\\c"), R"("a\"b\\c")");
  EXPECT_EQ(json_text(std::string("\0\n\x1F\x7F", 4)), R"("\u0000\u000A\u001F\u007F")");
  EXPECT_EQ(json_text("\xFF"), std::string("\"") + replaced + "\"");
}

TEST(JsonWriter, WritesNestedValuesWithCommasBetweenThem) {
  json_writer_t json;
  json.open_object().member("number", std::int64_t{-3}).member("text", "a").member("truth", true);
  json.key("nothing").null();
  json.key("list").open_list().value(std::int64_t{1}).value("b").open_object().close().close();
  json.key("empty").open_list().close().close();
  EXPECT_EQ(json.text(), R"({
  "number": -3,
  "text": "a",
  "truth": true,
  "nothing": null,
  "list": [
    1,
    "b",
    {}
  ],
  "empty": []
}
)");
}

}  // namespace
}  // namespace edid_cli

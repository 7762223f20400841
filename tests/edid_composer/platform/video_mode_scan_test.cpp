// The reading of a video mode's entry, compared with scanf, whose grammar it has.
#include "edid_composer/platform/video_mode_entry.h"
#include "support/long_loops.h"

#include <gtest/gtest.h>

#include <cinttypes>
#include <cstdio>
#include <cstring>
#include <random>
#include <string>

namespace {

using edid_composer::_scan_video_mode;
using edid_composer::video_mode_words_t;

/// Both read @p text into words that nobody has cleared: what is not read stays the same.
void expect_as_scanf(const std::string &text) {
  video_mode_words_t words{-7, {"first", "second", "third"}};
  video_mode_words_t scanned = words;
  const int fields = _scan_video_mode(text.c_str(), &words);
  const int scanned_fields = std::sscanf(text.c_str(), "%" SCNd64 "%9s%9s%9s", &scanned.number, scanned.flags[0],
                                         scanned.flags[1], scanned.flags[2]);
  // scanf tells a text that ends before any number (EOF) from one that holds something else.
  ASSERT_EQ(fields, scanned_fields < 0 ? 0 : scanned_fields) << testing::PrintToString(text);
  if (fields == 0) return;
  ASSERT_EQ(words.number, scanned.number) << testing::PrintToString(text);
  for (int i = 0; i < 3; ++i)
    ASSERT_STREQ(words.flags[i], scanned.flags[i]) << testing::PrintToString(text);
}

TEST(VideoModeScan, ReadsChosenTextsAsScanfDoes) {
  for (const char *const text : {"",
                                 " ",
                                 "\t\n",
                                 "16",
                                 " 16 ",
                                 "16 FP",
                                 "16 FP TBH SBSH",
                                 "16 FP TBH SBSH more",
                                 "16FP",
                                 "0x10",
                                 "-",
                                 "+",
                                 "- 5",
                                 "+-5",
                                 "-5 FP",
                                 "+5",
                                 "007",
                                 "16 123456789",
                                 "16 1234567890",
                                 "16 123456789012345678901234567890",
                                 "FP 16",
                                 "9223372036854775807",
                                 "9223372036854775808",
                                 "-9223372036854775809",
                                 "99999999999999999999999999999 FP",
                                 "4294967312 FP",
                                 "16\vFP\fTBH\rSBSH",
                                 "16\xA0 FP",
                                 "16 \xC3\xA9",
                                 "\xFF",
                                 "1e5",
                                 "1.5",
                                 "16,FP"}) {
    expect_as_scanf(text);
  }
}

TEST(VideoModeScan, ReadsRandomTextsAsScanfDoes) {
  const unsigned texts = test_support::rounds(3000, 300000);
  // Blanks, signs and digits often, any other byte now and then.
  constexpr char likely[] = "   \t\n\v\f\r0123456789+-xFPTBHS.";
  std::mt19937 random(20121);
  const auto below = [&](unsigned limit) { return std::uniform_int_distribution<unsigned>(0, limit - 1)(random); };
  unsigned with_number = 0;
  for (unsigned i = 0; i < texts; ++i) {
    std::string text = below(2) == 0 ? std::to_string(below(100)) : "";
    for (unsigned length = below(45); length > 0; --length) {
      text += below(20) == 0 ? static_cast<char>(below(255) + 1) : likely[below(sizeof likely - 1)];
    }
    ASSERT_NO_FATAL_FAILURE(expect_as_scanf(text));
    video_mode_words_t words{};
    if (_scan_video_mode(text.c_str(), &words) > 0) ++with_number;
  }
  EXPECT_GT(with_number, texts / 2);
}

}  // namespace

#include "first_difference.h"

#include <gtest/gtest.h>

namespace {

using golden::first_difference;

TEST(FirstDifference, OfEqualTextsIsNone) {
  EXPECT_EQ(first_difference("", ""), "");
  EXPECT_EQ(first_difference("a\nb\n", "a\nb\n"), "");
}

TEST(FirstDifference, IsToldByItsLineInBothTexts) {
  EXPECT_EQ(first_difference("a\nbc\td\ne\n", "a\nbc d\nx\n"),
            "line 2\n  expected: \"bc\\td\\n\"\n  actual:   \"bc d\\n\"");
}

TEST(FirstDifference, CanStandAtTheVeryBeginning) {
  EXPECT_EQ(first_difference("x\n", "\n"), "line 1\n  expected: \"x\\n\"\n  actual:   \"\\n\"");
}

TEST(FirstDifference, TellsWhichTextEndsFirst) {
  EXPECT_EQ(first_difference("a\nb\n", "a\n"), "line 2\n  expected: \"b\\n\"\n  actual:   the text has ended");
  EXPECT_EQ(first_difference("a\n", "a\nb\n"), "line 2\n  expected: the text has ended\n  actual:   \"b\\n\"");
}

TEST(FirstDifference, SeesAMissingLastNewline) {
  EXPECT_EQ(first_difference("a\n", "a"), "line 1\n  expected: \"a\\n\"\n  actual:   \"a\"");
}

}  // namespace

// The line under a diagnostic, and the mark.
#include "diag/Excerpt.h"

#include <gtest/gtest.h>

#include <string>

namespace diag {
namespace {

TEST(ExcerptTest, MarksTheExactText) {
  EXPECT_EQ(Excerpt("one\nsetAttr \".fl\" 35;\nthree\n", {12, 5}),
            "setAttr \".fl\" 35;\n"
            "        ^~~~~\n");
}

TEST(ExcerptTest, ARangeOfNoBytesIsACaret) {
  EXPECT_EQ(Excerpt("one\ntwo\n", {5, 0}), "two\n ^\n");
  EXPECT_EQ(Excerpt("one\ntwo", {7, 0}), "two\n   ^\n");
}

TEST(ExcerptTest, AMarkEndsWithItsLine) {
  EXPECT_EQ(Excerpt("one\ntwo\nthree\n", {4, 9}), "two\n^~~\n");
  EXPECT_EQ(Excerpt("one\r\ntwo\r\n", {0, 8}), "one\n^~~\n");
}

TEST(ExcerptTest, WideCharactersTakeTwoColumnsAndMarksOverOthersNone) {
  // Two ideographs, then "e" with an acute accent of its own.
  EXPECT_EQ(Excerpt("\u30ab\u30e1e\u0301 = \u6620;", {11, 5}),
            "\u30ab\u30e1e\u0301 = \u6620;\n"
            "       ^~~~\n");
}

TEST(ExcerptTest, ALongLineIsCutAroundTheMark) {
  const std::string line = std::string(300, 'a') + "here" + std::string(300, 'b');
  const std::string excerpt = Excerpt(line, {300, 4});
  EXPECT_EQ(excerpt, "..." + std::string(40, 'a') + "here" + std::string(56, 'b') + "...\n" +
                         std::string(43, ' ') + "^~~~\n");
}

TEST(ExcerptTest, TheEndOfALongLineIsShown) {
  const std::string line = std::string(300, 'a') + "end";
  EXPECT_EQ(Excerpt(line + "\nnext", {300, 3}),
            "..." + std::string(40, 'a') + "end\n" + std::string(43, ' ') + "^~~\n");
}

TEST(ExcerptTest, TheBeginningOfALongLineIsShown) {
  const std::string line = "begin" + std::string(300, 'a');
  EXPECT_EQ(Excerpt(line, {0, 5}), "begin" + std::string(95, 'a') + "...\n^~~~~\n");
}

TEST(ExcerptTest, ALongRangeIsMarkedAsFarAsItIsShown) {
  const std::string line(1000, 'a');
  EXPECT_EQ(Excerpt(line, {0, 1000}), std::string(100, 'a') + "...\n^" + std::string(99, '~') + '\n');
}

TEST(ExcerptTest, EscapesAreMarkedWhole) {
  EXPECT_EQ(Excerpt("a\x1b[31mb\n", {1, 1}), "a\\x1b[31mb\n ^~~~\n");
  EXPECT_EQ(Excerpt("\x1bx\n", {1, 1}), "\\x1bx\n    ^\n");
}

TEST(ExcerptTest, ATabIsABlankAndACharacterOfSeveralBytesOneColumn) {
  EXPECT_EQ(Excerpt("\tx\n", {1, 1}), " x\n ^\n");
  EXPECT_EQ(Excerpt("\xc3\xa4\xc3\xb6x\n", {4, 1}), "\xc3\xa4\xc3\xb6x\n  ^\n");
}

TEST(ExcerptTest, WhatLiesBeyondTheTextHasNoLine) {
  EXPECT_EQ(Excerpt("one", {4, 1}), "");
  EXPECT_EQ(Excerpt("", {0, 0}), "");
}

TEST(ExcerptTest, EveryRangeOfEveryTextIsShownInBoundedSpace) {
  const std::string texts[] = {std::string(250, '\xc3'), "a\n\nb\xe2\x82", std::string(120, '\n'),
                               std::string(99, 'x') + "\xe2\x82\xac" + std::string(99, 'y')};
  for (const std::string& text : texts) {
    for (std::size_t offset = 0; offset <= text.size(); ++offset) {
      for (const std::size_t length : {0u, 1u, 7u, 400u}) {
        EXPECT_LE(Excerpt(text, {offset, length}).size(), 1300u);
      }
    }
  }
}

}  // namespace
}  // namespace diag

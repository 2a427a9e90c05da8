#include "hostutil/HostCompare.h"

#include <gtest/gtest.h>

namespace {

TEST(HostCompareTest, OnlyTheLettersAToZAreFolded) {
  for (int byte = 0; byte < 256; ++byte) {
    const bool letter = byte >= 'A' && byte <= 'Z';
    EXPECT_EQ(FoldCase(static_cast<unsigned char>(byte)), letter ? byte + 32 : byte) << byte;
  }
}

TEST(HostCompareTest, EveryPairOfBytesComparesAsItsFoldedForms) {
  for (int a = 1; a < 256; ++a) {
    for (int b = 1; b < 256; ++b) {
      const char textA[] = {static_cast<char>(a), '\0'};
      const char textB[] = {static_cast<char>(b), '\0'};
      const int difference =
          FoldCase(static_cast<unsigned char>(a)) - FoldCase(static_cast<unsigned char>(b));
      const int expected = difference < 0 ? -1 : difference > 0 ? 1 : 0;
      ASSERT_EQ(HostCompareNoCase(textA, textB), expected) << a << " " << b;
    }
  }
}

TEST(HostCompareTest, CaseIsIgnoredThroughTheWholeText) {
  EXPECT_EQ(HostCompareNoCase("//Maya", "//MAYA"), 0);
  EXPECT_EQ(HostCompareNoCase("createNode", "CREATENODE"), 0);
  EXPECT_EQ(HostCompareNoCase("AnimCurve", "animcurve"), 0);
  EXPECT_NE(HostCompareNoCase("animCurve", "animCurveTL"), 0);
}

TEST(HostCompareTest, AShorterTextComesBeforeALongerOneThatBeginsWithIt) {
  EXPECT_EQ(HostCompareNoCase("abc", "ABCd"), -1);
  EXPECT_EQ(HostCompareNoCase("ABCd", "abc"), 1);
  EXPECT_EQ(HostCompareNoCase("", "a"), -1);
  EXPECT_EQ(HostCompareNoCase("", ""), 0);
}

TEST(HostCompareTest, TheCharactersBesideTheLettersAreNotFolded) {
  EXPECT_NE(HostCompareNoCase("@", "`"), 0);
  EXPECT_NE(HostCompareNoCase("[", "{"), 0);
  EXPECT_NE(HostCompareNoCase("\xC4", "\xE4"), 0);
}

TEST(HostCompareTest, BytesAbove127AreLargerThanLetters) { EXPECT_EQ(HostCompareNoCase("\xE4", "z"), 1); }

TEST(HostCompareTest, NullCountsAsTheEmptyText) {
  EXPECT_EQ(HostCompareNoCase(nullptr, ""), 0);
  EXPECT_EQ(HostCompareNoCase(nullptr, nullptr), 0);
  EXPECT_EQ(HostCompareNoCase(nullptr, "a"), -1);
  EXPECT_EQ(HostCompareNoCase("a", nullptr), 1);
}

}  // namespace

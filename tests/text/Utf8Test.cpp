#include "text/Utf8.h"

#include <gtest/gtest.h>

#include <string>

namespace text {
namespace {

TEST(Utf8, CharactersOfEachLengthHaveTheirPoint) {
  EXPECT_EQ(CharacterAt("a", 0).point, U'a');
  EXPECT_EQ(CharacterAt("\xc3\xa9", 0).point, U'\u00e9');
  EXPECT_EQ(CharacterAt("x\xe2\x82\xac", 1).point, U'\u20ac');
  EXPECT_EQ(CharacterAt("\xf0\x9f\x8e\xa5", 0).point, U'\U0001f3a5');
  EXPECT_EQ(CharacterAt("a", 0).length, 1u);
  EXPECT_EQ(CharacterAt("\xc3\xa9", 0).length, 2u);
  EXPECT_EQ(CharacterAt("x\xe2\x82\xac", 1).length, 3u);
  EXPECT_EQ(CharacterAt("\xf0\x9f\x8e\xa5", 0).length, 4u);
}

TEST(Utf8, WhatIsNoCharacterHasNoLength) {
  for (const std::string_view bytes :
       {"\x80", "\xff", "\xc3", "\xe2\x82", "\xf0\x9f\x8e", "\xc3z", "\xc0\xaf", "\xe0\x9f\xbf",
        "\xf0\x8f\xbf\xbf", "\xed\xa0\x80", "\xf4\x90\x80\x80", "\xf5\x80\x80\x80"}) {
    EXPECT_EQ(CharacterAt(bytes, 0).length, 0u);
    EXPECT_FALSE(IsUtf8(bytes));
  }
  for (const std::string_view bytes : {"", "a", "\xed\x9f\xbf", "\xf4\x8f\xbf\xbf", "\xef\xbf\xbd"}) {
    EXPECT_TRUE(IsUtf8(bytes));
    EXPECT_EQ(ValidUtf8(bytes), bytes);
  }
}

TEST(Utf8, EachByteThatIsNoPartOfACharacterIsReplaced) {
  EXPECT_EQ(ValidUtf8("a\xff\xc3"), "a\xef\xbf\xbd\xef\xbf\xbd");
  EXPECT_EQ(ValidUtf8("\xe2\x82z"), "\xef\xbf\xbd\xef\xbf\xbdz");
  EXPECT_EQ(ValidUtf8(std::string_view("\0b", 2)), std::string_view("\0b", 2));
}

}  // namespace
}  // namespace text

#include "diag/ShownText.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

namespace diag {
namespace {

TEST(ShownTextTest, PlainTextStaysAsItIs) {
  EXPECT_EQ(ShownText("|rig|cam:shot \"1\" \\"), "|rig|cam:shot \"1\" \\");
  EXPECT_EQ(ShownText("Kamera \xc3\xbc \xe6\x97\xa5 \xf0\x9f\x8e\xa5"),
            "Kamera \xc3\xbc \xe6\x97\xa5 \xf0\x9f\x8e\xa5");
}

TEST(ShownTextTest, ControlCharactersAreEscaped) {
  EXPECT_EQ(ShownText("a\nb\rc\td"), "a\\nb\\rc\\td");
  EXPECT_EQ(ShownText(std::string_view("\x1b[31m\0\x7f", 7)), "\\x1b[31m\\x00\\x7f");
  EXPECT_EQ(ShownText("\xc2\x9b"), "\\u009b");
}

TEST(ShownTextTest, InvisibleCharactersThatTurnTheTextAreEscaped) {
  EXPECT_EQ(ShownText("a\xe2\x80\xae"
                      "b"),
            "a\\u202eb");
  EXPECT_EQ(ShownText("\xef\xbb\xbf"), "\\ufeff");
  EXPECT_EQ(ShownText("\xd8\x9c"), "\\u061c");
}

TEST(ShownTextTest, BytesThatAreNoUtf8AreEscapedOneByOne) {
  EXPECT_EQ(ShownText("\xff"), "\\xff");
  EXPECT_EQ(ShownText("a\xc3"), "a\\xc3");                  // cut off
  EXPECT_EQ(ShownText("\xc0\xaf"), "\\xc0\\xaf");           // longer than need be
  EXPECT_EQ(ShownText("\xe0\x80\x80"), "\\xe0\\x80\\x80");  // likewise
  EXPECT_EQ(ShownText("\xed\xa0\x80"), "\\xed\\xa0\\x80");  // a surrogate
  EXPECT_EQ(ShownText("\xf4\x90\x80\x80"), "\\xf4\\x90\\x80\\x80");
  EXPECT_EQ(ShownText("\xe6\x97x"), "\\xe6\\x97x");
}

}  // namespace
}  // namespace diag

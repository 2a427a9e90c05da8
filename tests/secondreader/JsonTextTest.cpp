#include "tests/secondreader/JsonText.h"

#include <gtest/gtest.h>

namespace secondreader {
namespace {

TEST(JsonTextTest, QuotesBackslashesAndControlsAreEscaped) {
  EXPECT_EQ(jsonText("a\"b\\c"), R"("a\"b\\c")");
  EXPECT_EQ(jsonText(std::string_view("\0\n\x1f\x7f", 4)), R"("\u0000\u000a\u001f\u007f")");
  EXPECT_EQ(jsonText("\xC2\x80 \xC2\x9F \xC2\xA0"), "\"\\u0080 \\u009f \xC2\xA0\"");
}

TEST(JsonTextTest, ValidCharactersStay) {
  EXPECT_EQ(jsonText("\xC3\xA9 \xE2\x82\xAC \xF0\x9F\x8E\xA5"), "\"\xC3\xA9 \xE2\x82\xAC \xF0\x9F\x8E\xA5\"");
}

TEST(JsonTextTest, EachByteThatIsNoPartOfACharacterIsReplaced) {
  const std::string mark = "\xEF\xBF\xBD";
  EXPECT_EQ(jsonText("a\xFF"), "\"a" + mark + "\"");
  EXPECT_EQ(jsonText("\xC0\x80"), "\"" + mark + mark + "\"");
  EXPECT_EQ(jsonText("\xE2\x82"), "\"" + mark + mark + "\"");
  EXPECT_EQ(jsonText("\xED\xA0\x80"), "\"" + mark + mark + mark + "\"");
  EXPECT_EQ(jsonText("\xF4\x90\x80\x80"), "\"" + mark + mark + mark + mark + "\"");
}

}  // namespace
}  // namespace secondreader

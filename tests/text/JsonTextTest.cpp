// JSON strings in their two forms.
#include "text/JsonText.h"

#include <gtest/gtest.h>

#include <string>
#include <string_view>

namespace text {
namespace {

std::string Json(std::string_view bytes, JsonForm form) {
  std::string out = "before ";
  AppendJsonText(&out, bytes, form);
  return out.substr(7);
}

TEST(JsonTextTest, Utf8StaysAsItIsAndWhatIsNotBecomesTheReplacement) {
  const std::string cases[][2] = {{"rig", "rig"},
                                  {"\xC3\xA9", "\xC3\xA9"},
                                  {"\xE2\x82\xAC", "\xE2\x82\xAC"},
                                  {"\xF0\x9F\x8E\xA5", "\xF0\x9F\x8E\xA5"},
                                  {"a\x80z", "a\xEF\xBF\xBDz"},
                                  {"\xE2\x82", "\xEF\xBF\xBD\xEF\xBF\xBD"},
                                  {"\xC2\xA0", "\xC2\xA0"}};
  for (const auto& [bytes, shown] : cases) EXPECT_EQ(Json(bytes, JsonForm::Utf8), '"' + shown + '"');
}

TEST(JsonTextTest, Utf8EscapesControlsByTheirNumbers) {
  EXPECT_EQ(Json(std::string("\0\t\n\x1b\x1f ", 6), JsonForm::Utf8),
            "\"\\u0000\\u0009\\u000a\\u001b\\u001f \"");
  EXPECT_EQ(Json("\x7f", JsonForm::Utf8), "\"\\u007f\"");
  EXPECT_EQ(Json("\xC2\x80\xC2\x9B\xC2\x9F", JsonForm::Utf8), "\"\\u0080\\u009b\\u009f\"");
}

TEST(JsonTextTest, AsciiEscapesAllElse) {
  EXPECT_EQ(Json("\t\n\x1b\x7f", JsonForm::Ascii), "\"\\t\\n\\u001b\\u007f\"");
  EXPECT_EQ(Json("\xC3\xA9\xF0\x9F\x8E\xA5\x80", JsonForm::Ascii), "\"\\u00e9\\ud83c\\udfa5\\ufffd\"");
}

TEST(JsonTextTest, QuotesAndBackslashesAreEscaped) {
  for (const JsonForm form : {JsonForm::Ascii, JsonForm::Utf8})
    EXPECT_EQ(Json("a\"b\\c/", form), "\"a\\\"b\\\\c/\"");
}

}  // namespace
}  // namespace text

// The table of classes against the classes written out.
#include "scan/ByteClasses.h"

#include <gtest/gtest.h>

#include <string_view>

namespace scan_tests {
namespace {

bool IsIn(std::string_view bytes, char c) { return bytes.find(c) != std::string_view::npos; }

TEST(ByteClassesTest, EveryByteBelongsToItsClassesAndNoOther) {
  constexpr std::string_view kLetters = "abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ";
  constexpr std::string_view kDigits = "0123456789";
  for (int byte = -128; byte < 128; ++byte) {
    const char c = static_cast<char>(byte);
    EXPECT_EQ(scan::IsWhiteSpace(c), IsIn(" \t\r\n", c)) << byte;
    EXPECT_EQ(scan::IsWordEnd(c), IsIn(" \t\r\n;", c)) << byte;
    EXPECT_EQ(scan::IsAny(c, scan::kNul), byte == 0) << byte;
    EXPECT_EQ(scan::IsLetter(c), IsIn(kLetters, c)) << byte;
    EXPECT_EQ(scan::IsDigit(c), IsIn(kDigits, c)) << byte;
    EXPECT_EQ(scan::IsNumberStart(c), IsIn(kDigits, c) || IsIn("-.", c)) << byte;
    EXPECT_EQ(scan::IsAny(c, scan::kQuote), IsIn("\"", c)) << byte;
    EXPECT_EQ(scan::IsAny(c, scan::kKeywordStart), IsIn("cCsS", c)) << byte;
  }
}

TEST(ByteClassesTest, SeveralClassesAreAskedForAtOnce) {
  EXPECT_TRUE(scan::IsAny('"', scan::kNul | scan::kQuote));
  EXPECT_TRUE(scan::IsAny('\0', scan::kNul | scan::kQuote));
  EXPECT_FALSE(scan::IsAny('\'', scan::kNul | scan::kQuote));
}

}  // namespace
}  // namespace scan_tests

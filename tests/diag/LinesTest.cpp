#include "diag/Lines.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

namespace diag {

void PrintTo(const LineAndColumn& place, std::ostream* out) { *out << place.line << ':' << place.column; }

namespace {

using Place = LineAndColumn;

TEST(LinesTest, BothCountFromOne) {
  Lines lines("ab\n\ncd");
  EXPECT_EQ(lines.At(0), (Place{1, 1}));
  EXPECT_EQ(lines.At(1), (Place{1, 2}));
  EXPECT_EQ(lines.At(2), (Place{1, 3}));
  EXPECT_EQ(lines.At(3), (Place{2, 1}));
  EXPECT_EQ(lines.At(4), (Place{3, 1}));
  EXPECT_EQ(lines.At(6), (Place{3, 3}));
}

TEST(LinesTest, AnOffsetBeyondTheTextIsItsEnd) {
  Lines lines("ab\n");
  EXPECT_EQ(lines.At(3), (Place{2, 1}));
  EXPECT_EQ(lines.At(1u << 31), (Place{2, 1}));
}

TEST(LinesTest, AnEmptyTextHasOneLine) { EXPECT_EQ(Lines("").At(0), (Place{1, 1})); }

TEST(LinesTest, ACarriageReturnIsAByteOfItsLine) {
  Lines lines("a\r\nb");
  EXPECT_EQ(lines.At(2), (Place{1, 3}));
  EXPECT_EQ(lines.At(3), (Place{2, 1}));
}

TEST(LinesTest, ACarriageReturnAloneEndsItsLine) {
  Lines lines("a\rb\r\r\nc\n\rd\r");
  EXPECT_EQ(lines.At(1), (Place{1, 2}));
  EXPECT_EQ(lines.At(2), (Place{2, 1}));
  EXPECT_EQ(lines.At(4), (Place{3, 1}));
  EXPECT_EQ(lines.At(5), (Place{3, 2}));
  EXPECT_EQ(lines.At(6), (Place{4, 1}));
  EXPECT_EQ(lines.At(8), (Place{5, 1}));
  EXPECT_EQ(lines.At(9), (Place{6, 1}));
  EXPECT_EQ(lines.At(11), (Place{7, 1}));
}

TEST(LinesTest, EveryOffsetOfALongTextAgreesWithCounting) {
  std::string text;
  for (int line = 0; text.size() < 20000; ++line) {
    // Some lines are longer than the blocks that the text is counted in.
    constexpr std::string_view kEnds[] = {"\n", "\r\n", "\r"};
    text += std::string(line % 50 == 49 ? 5000 : static_cast<std::size_t>(line % 7), 'x');
    text += kEnds[line % 11 % 3];
  }
  Lines lines(text);
  Place expected;
  for (std::size_t at = 0; at < text.size(); ++at) {
    ASSERT_EQ(lines.At(at), expected) << at;
    ++expected.column;
    const bool pair = text[at] == '\r' && at + 1 < text.size() && text[at + 1] == '\n';
    if ((text[at] == '\n' || text[at] == '\r') && !pair) expected = {expected.line + 1, 1};
  }
}

TEST(LinesTest, ATextThatEndsWithABlockHasAnEnd) {
  const std::string text(4096, '\n');
  EXPECT_EQ(Lines(text).At(4096), (Place{4097, 1}));
  // A line end of two bytes that two blocks share.
  EXPECT_EQ(Lines(std::string(4095, 'x') + "\r\ny").At(4096), (Place{1, 4097}));
  EXPECT_EQ(Lines(std::string(4095, 'x') + "\r\ny").At(4097), (Place{2, 1}));
}

}  // namespace
}  // namespace diag

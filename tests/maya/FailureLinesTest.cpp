// The line of the text that is noted for a failure.
#include "hostapi/ErrorCodes.h"
#include "hostutil/HostSetup.h"
#include "tests/support/ReaderFixture.h"

namespace testsupport {
namespace {

using namespace std::string_view_literals;

class FailureLinesTest : public ReaderTest {
 protected:
  // Reads the text, which fails with that code, and returns the line that was noted for it.
  std::int64_t LineOf(std::string_view text, HostError code) {
    EXPECT_EQ(Read(text), code);
    return HostTakeNotedLine(code);
  }

  std::int64_t LineOfByte(std::string_view text) { return LineOf(text, 1289985); }
  std::int64_t LineOfEnd(std::string_view text) { return LineOf(text, 1289986); }
};

TEST_F(FailureLinesTest, ABadByteIsAtTheLineThatItStandsIn) {
  EXPECT_EQ(LineOfByte("$ "), 1);
  EXPECT_EQ(LineOfByte("a b\nc\n  \x80 \n\n"), 3);
  EXPECT_EQ(LineOfByte("createNode camera -n \"c\";\n\n\tsetAttr $;\n"), 3);
}

TEST_F(FailureLinesTest, LinesInsideStringsAndCommentsCount) {
  EXPECT_EQ(LineOfByte("\"a\nb\"\n/* 1\n2\n3 */\n// x\n$ "), 7);
  EXPECT_EQ(LineOfByte("setAttr \"a\\\"\n\";\n@ "), 3);
}

TEST_F(FailureLinesTest, EveryKindOfLineEndCountsOnce) {
  EXPECT_EQ(LineOfByte("a\r\nb\r\n\r\n$ "), 4);
  EXPECT_EQ(LineOfByte("a\rb\r\r$ "), 4);
  EXPECT_EQ(LineOfByte("a\n\rb $ "), 3);
}

TEST_F(FailureLinesTest, TextThatIsPassedOverInBulkCounts) {
  std::string text;
  for (int line = 1; line < 500; ++line) text += "\t0.25 -1.5 17 \"x\" 3;\n";
  EXPECT_EQ(LineOfByte(text + "[ "), 500);
}

TEST_F(FailureLinesTest, ATextThatEndsTooSoonIsAtTheBeginningOfWhatIsOpen) {
  EXPECT_EQ(LineOfEnd("a\nb \"c\nd\n\n"), 2);
  EXPECT_EQ(LineOfEnd("a\n\n/* c\nd\n"), 3);
  EXPECT_EQ(LineOfEnd("a;\nb"), 2);
  EXPECT_EQ(LineOfEnd("a;\nb;\n// c"), 3);
}

TEST_F(FailureLinesTest, ACommandThatNeverEndsIsAtTheLastLineThatHoldsSomething) {
  EXPECT_EQ(LineOfEnd("createNode camera\n -n \"c\"\n\n \t\n"), 2);
  EXPECT_EQ(LineOfEnd("\n\nconnectAttr \"a.b\" "), 3);
}

TEST_F(FailureLinesTest, AfterAnEmbeddedNulNothingCounts) {
  EXPECT_EQ(LineOfEnd("createNode camera\n\0\n\n\n"sv), 1);
}

TEST_F(FailureLinesTest, ANumberThatCannotBeReadIsAtItsLine) {
  EXPECT_EQ(LineOf("createNode animCurveTL -n \"a\";\n setAttr \".ktv[0:1]\" 1 0\n 2 --x;\n",
                   HOST_ERR_NUMBER_SYNTAX),
            3);
  EXPECT_EQ(LineOf("createNode transform -n \"a\";\nsetAttr \".t\" 1 2\n\n 1e999;\n", HOST_ERR_NUMBER_RANGE),
            4);
}

TEST_F(FailureLinesTest, EveryNumberOfARunIsAtItsLine) {
  const std::string curve =
      "createNode animCurveTL -n \"a\";\nsetAttr \".ktv[0:2]\" 1 0\n\t2 0.5\r\n\n 3 1;\n";
  const std::string transform = "createNode transform -n \"b\";\nsetAttr \".t\" 1\n2\n\n 3;\n";
  constexpr std::int64_t kLines[] = {2, 2, 3, 3, 5, 5, 7, 8, 10};
  for (std::size_t number = 0; number < std::size(kLines); ++number) {
    const UtilityRehearsal failing(HOST_UTILITY_NumberScan, static_cast<std::int64_t>(number) + 1, 7123);
    EXPECT_EQ(LineOf(curve + transform, 7123), kLines[number]) << number;
  }
}

TEST_F(FailureLinesTest, ATextWithoutAFailureNotesNothing) {
  EXPECT_EQ(Read("createNode camera -n \"c\";\n"), 0);
  for (const HostError code : {0, 1289985, 1289986}) EXPECT_EQ(HostTakeNotedLine(code), 0);
}

}  // namespace
}  // namespace testsupport

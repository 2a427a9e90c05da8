// Keys of animation curves, and who owns them.
#include <algorithm>

#include "hostapi/ErrorCodes.h"
#include "hostutil/HostSetup.h"
#include "plugin/ErrorCodes.h"
#include "tests/support/ReaderFixture.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

class KeysTest : public ReaderTest {
 protected:
  HostError ReadWith(std::string_view commands) {
    return Read("createNode animCurveTL -n \"a\" -p \"p\";\n" + std::string(commands) + "\n");
  }

  Keys KeysWith(std::string_view commands) {
    EXPECT_EQ(ReadWith(commands), 0) << commands;
    return KeysOf(0);
  }

  // The lists that are held: that of the curves, and those of keys.
  static std::size_t HeldLists() { return HeldObjects().size(); }
};

TEST_F(KeysTest, NumbersArePairedInOrder) {
  EXPECT_EQ(KeysWith("setAttr -s 2 \".ktv[0:1]\" 1 0 10 100;"), (Keys{{1, 0}, {10, 100}}));
  EXPECT_EQ(KeysWith("setAttr -s 3 \".ktv[0:2]\"  1 0 2 5.5 3 10;"), (Keys{{1, 0}, {2, 5.5}, {3, 10}}));
}

TEST_F(KeysTest, LinesAmongTheNumbersAreCounted) {
  for (const std::string numbers : {"1\n0\n\n10 100", "1 0\r\n\t2\n5.5\n", "\n1\n0\n7", "1\n0 x\n2\n3\n"}) {
    const std::string text = "createNode animCurveTL;\nsetAttr \".ktv\" " + numbers + ";\n \n";
    ASSERT_EQ(Read(text), 0);
    EXPECT_EQ(scene().line, std::count(text.begin(), text.end(), '\n')) << numbers;
  }
  std::string many = "setAttr \".ktv\"";
  for (int number = 0; number < 1500; ++number) many += " \n" + std::to_string(number);
  ASSERT_EQ(ReadWith(many + ";"), 0);
  EXPECT_EQ(scene().line, 1502);
}

TEST_F(KeysTest, LinesAreCountedUpToANumberThatFails) {
  const UtilityRehearsal failing(HOST_UTILITY_NumberScan, 3, 77);
  EXPECT_EQ(ReadWith("setAttr \".ktv\" 1\n0\n\n10\n100;"), 77);
  EXPECT_EQ(scene().line, 4);
}

TEST_F(KeysTest, AnOddLastNumberIsAKeyOfValueZero) {
  EXPECT_EQ(KeysWith("setAttr \".ktv[0:1]\" 1 0 10;"), (Keys{{1, 0}, {10, 0}}));
  EXPECT_EQ(KeysWith("setAttr \".ktv[0]\" -4.5;"), (Keys{{-4.5, 0}}));
}

TEST_F(KeysTest, AValueThatIsNoNumberIsLostAndCountsZero) {
  EXPECT_EQ(KeysWith("setAttr \".ktv\" 1 \"x\" 2 3;"), (Keys{{1, 0}, {2, 3}}));
  EXPECT_EQ(KeysWith("setAttr \".ktv\" 1 /*c*/ 5 6;"), (Keys{{1, 0}, {5, 6}}));
  EXPECT_EQ(KeysWith("setAttr \".ktv\" 1 -s 2 3;"), (Keys{{1, 0}, {2, 3}}));
}

TEST_F(KeysTest, OtherTokensBetweenKeysArePassedOver) {
  EXPECT_EQ(KeysWith("setAttr \".ktv\" \"a\" 1 2 yes -k on 3 4 ( ) /*c*/ 5 6 : ;"),
            (Keys{{1, 2}, {3, 4}, {5, 6}}));
}

TEST_F(KeysTest, TheKeysAreFoundAfterALongOtherAttribute) {
  std::string many;
  for (int i = 0; i < 100; ++i) many += i % 9 == 0 ? "\n\t18.5 no" : " 1 yes";
  for (const char* const between :
       {" ", " \"x\" ", " /* ; */ ", " // ;\n", " -k on ", " -5 ", " -k ; ", " ( ) : + ", " sel "}) {
    SCOPED_TRACE(between);
    EXPECT_EQ(KeysWith("setAttr \".kit\" " + many + between + many + " \".ktv\" 3 4;"), (Keys{{3, 4}}));
    EXPECT_EQ(KeysWith("setAttr \".kit\" " + many + between + many + ";\nsetAttr \".ktv\" 5 6;"),
              (Keys{{5, 6}}));
  }
  EXPECT_EQ(ReadWith("setAttr \".kit\" " + many + " ? " + many + ";"), kReadingError);
  EXPECT_EQ(ReadWith("setAttr \".kit\" " + many), kUnexpectedEnd);
}

TEST_F(KeysTest, TheAttributeIsFoundAnywhereInTheText) {
  for (const char* const name :
       {".ktv", ".ktv[0:11]", ".keyTimeValue", ".keyTimeValue[5:9]", "a.ktv[7]", "x.ktvx", "..keyTimeValues"})
    EXPECT_EQ(KeysWith("setAttr \"" + std::string(name) + "\" 1 2;"), (Keys{{1, 2}})) << name;
}

TEST_F(KeysTest, TheAttributeKeepsItsCase) {
  for (const char* const name :
       {".KTV[0]", ".Ktv", ".keytimevalue", ".KeyTimeValue", "ktv", "keyTimeValue", "", "."}) {
    SCOPED_TRACE(name);
    ASSERT_EQ(ReadWith("setAttr \"" + std::string(name) + "\" 1 2;"), 0);
    EXPECT_EQ(CurveAt(0).keys, nullptr);
  }
}

TEST_F(KeysTest, AnAttributeOf255BytesReadsAsEmpty) {
  EXPECT_EQ(KeysWith("setAttr \".ktv" + std::string(248, 'x') + "\" 1 2;"), (Keys{{1, 2}}));
  ASSERT_EQ(ReadWith("setAttr \".ktv" + std::string(249, 'x') + "\" 1 2;"), 0);
  EXPECT_EQ(CurveAt(0).keys, nullptr);
}

TEST_F(KeysTest, TheSearchPassesOverOtherStringsAndTokens) {
  EXPECT_EQ(KeysWith("setAttr \".tan\" 18 yes : \".ktv[0]\" 1 2;"), (Keys{{1, 2}}));
}

TEST_F(KeysTest, TheSizeOptionTakesNothingAndOtherOptionsTakeATokenAlong) {
  EXPECT_EQ(KeysWith("setAttr -s \".ktv[0]\" 1 2;"), (Keys{{1, 2}}));
  EXPECT_EQ(KeysWith("setAttr -S \".ktv[0]\" 1 2;"), (Keys{{1, 2}}));
  EXPECT_EQ(KeysWith("setAttr -k on -s 2 -l off \".ktv[0]\" 1 2;"), (Keys{{1, 2}}));
  ASSERT_EQ(ReadWith("setAttr -k \".ktv[0]\" 1 2;"), 0);
  EXPECT_EQ(CurveAt(0).keys, nullptr);
  ASSERT_EQ(ReadWith("setAttr -" + std::string(254, 's') + " \".ktv[0]\" 1 2;"), 0);
  EXPECT_EQ(CurveAt(0).keys, nullptr);
}

TEST_F(KeysTest, AnOptionThatEatsTheSemicolonRunsOnIntoTheNextCommand) {
  ASSERT_EQ(ReadWith("setAttr -k;\ncreateNode camera -n \"lost\";\ncreateNode camera -n \"kept\";"), 0);
  ASSERT_EQ(CameraCount(), 1);
  EXPECT_STREQ(CameraAt(0).name, "kept");
  EXPECT_EQ(CurveAt(0).keys, nullptr);
}

TEST_F(KeysTest, ASecondKeyCommandAppends) {
  EXPECT_EQ(KeysWith("setAttr \".ktv[0]\" 1 2;\nsetAttr \".tan\" 18;\nsetAttr \".ktv[1:2]\" 3 4 5 6;"),
            (Keys{{1, 2}, {3, 4}, {5, 6}}));
}

TEST_F(KeysTest, AKeyCommandWithoutNumbersAddsNoKey) {
  ASSERT_EQ(ReadWith("setAttr \".ktv[0]\";"), 0);
  EXPECT_THAT(KeysOf(0), IsEmpty());
}

TEST_F(KeysTest, ACommandWithoutKeysStillWritesTheCurrentCurveBack) {
  ASSERT_EQ(Read("createNode animCurveTL -n \"a\" -p \"one\";\ncreateNode animCurveTL -n \"A\" -p \"two\";\n"
                 "setAttr \".tan\" 18;\n"),
            0);
  EXPECT_STREQ(CurveAt(0).name, "A");
  EXPECT_STREQ(CurveAt(0).parent, "two");
  EXPECT_EQ(CurveAt(0).keys, nullptr);
}

TEST_F(KeysTest, AFailedScanThrowsItsCode) {
  EXPECT_EQ(ReadWith("setAttr \".ktv[0:1]\" 1 0 2 --x;"), HOST_ERR_NUMBER_SYNTAX);
  EXPECT_EQ(ReadWith("setAttr \".ktv[0:1]\" --x 0;"), HOST_ERR_NUMBER_SYNTAX);
  EXPECT_EQ(ReadWith("setAttr \".ktv[0:1]\" 0 0 1e999 1;"), HOST_ERR_NUMBER_RANGE);
  EXPECT_THAT(Messages(), IsEmpty());
}

TEST_F(KeysTest, KeysReadBeforeAFailureStayWithTheCurrentCurve) {
  ASSERT_EQ(ReadWith("setAttr \".ktv[0]\" 9 8;\nsetAttr \".ktv[0:1]\" 1 2 3 --x;"), HOST_ERR_NUMBER_SYNTAX);
  EXPECT_EQ(KeysIn(scene().current.curve.keys), (Keys{{9, 8}, {1, 2}}));
}

TEST_F(KeysTest, KeysThatNoRecordHoldsGoWithTheParser) {
  for (const char* const tail : {"1 0 2 --x;", "1 0 $;", "1 0 \"x", "1 0 ", "1 0 2"}) {
    SCOPED_TRACE(tail);
    EXPECT_NE(ReadWith("setAttr \".ktv[0:1]\" " + std::string(tail)), 0);
    EXPECT_EQ(HeldLists(), 2u);
    EndScene();
    EXPECT_EQ(HeldLists(), 0u);
  }
}

TEST_F(KeysTest, TheKeysOfASecondCurveOfTheNameReplaceTheFirsts) {
  ASSERT_EQ(
      ReadWith(
          "setAttr \".ktv[0:1]\" 1 0 2 5;\ncreateNode animCurveTL -n \"a\";\nsetAttr \".ktv[0:1]\" 1 7 2 8;"),
      0);
  EXPECT_EQ(KeysOf(0), (Keys{{1, 7}, {2, 8}}));
  EXPECT_EQ(CurveAt(1).keys, nullptr);
  EXPECT_EQ(HeldLists(), 2u);
}

TEST_F(KeysTest, ASecondCurveWithoutKeysTakesTheFirstsAway) {
  ASSERT_EQ(
      ReadWith("setAttr \".ktv[0:1]\" 1 0 2 5;\ncreateNode animCurveTL -n \"a\";\nsetAttr \".tan\" 18;"), 0);
  EXPECT_EQ(CurveAt(0).keys, nullptr);
  EXPECT_EQ(HeldLists(), 1u);
}

TEST_F(KeysTest, UnnamedCurvesShareTheFirstRecord) {
  ASSERT_EQ(Read("createNode animCurveTL;\nsetAttr \".ktv[0]\" 1 0 2 1;\n"
                 "createNode animCurveTU;\nsetAttr \".ktv[0]\" 1 3 2 4;\n"),
            0);
  EXPECT_EQ(KeysOf(0), (Keys{{1, 3}, {2, 4}}));
  EXPECT_EQ(CurveAt(1).keys, nullptr);
}

TEST_F(KeysTest, CurvesOfTooLongNamesAreUnnamed) {
  ASSERT_EQ(
      Read("createNode animCurveTL -n \"" + std::string(300, 'a') + "\";\nsetAttr \".ktv[0]\" 1 0 2 1;\n" +
           "createNode animCurveTL -n \"" + std::string(300, 'b') + "\";\nsetAttr \".ktv[0]\" 5 6;\n"),
      0);
  EXPECT_EQ(KeysOf(0), (Keys{{5, 6}}));
  EXPECT_EQ(CurveAt(1).keys, nullptr);
}

TEST_F(KeysTest, ASelectBetweenEndsTheCurve) {
  ASSERT_EQ(
      ReadWith("setAttr \".ktv[0]\" 1 0 2 1;\nselect -ne \"a\";\nsetAttr \".ktv[0]\" 9 9;\n"
               "createNode animCurveTL -n \"A\";\nsetAttr \".ktv[0]\" 3 3 4 4;\nsetAttr \".ktv[0]\" 5 5;"),
      0);
  EXPECT_EQ(KeysOf(0), (Keys{{3, 3}, {4, 4}, {5, 5}}));
  EXPECT_EQ(HeldLists(), 2u);
}

TEST_F(KeysTest, ANodeMadeAfterKeysLeavesThemToTheirCurve) {
  for (const char* const node : {"transform", "camera", "locator", "mesh", "animCurveTA"}) {
    SCOPED_TRACE(node);
    EXPECT_EQ(
        KeysWith("setAttr \".ktv\" 1 2;\ncreateNode " + std::string(node) + " -n \"b\";\nsetAttr \".t\" 5;"),
        (Keys{{1, 2}}));
  }
}

TEST_F(KeysTest, FailedListsThrowTheirCodesAndLoseNothing) {
  struct Row {
    std::int32_t service;
    std::int64_t nth;
  };
  // The first list and record are the curve's, the second those of its keys; the comment parts two runs.
  for (const Row& row :
       {Row{HOST_UTILITY_ListCreate, 2}, Row{HOST_UTILITY_ListAppend, 2}, Row{HOST_UTILITY_ListAppend, 3}}) {
    {
      const UtilityRehearsal failing(row.service, row.nth, 7003);
      EXPECT_EQ(ReadWith("setAttr \".ktv\" 1 2 /**/ 3 4;"), 7003);
    }
    EndScene();
    EXPECT_EQ(HeldLists(), 0u);
  }
}

TEST_F(KeysTest, TheEndInsideAKeyCommandIsAnUnexpectedEnd) {
  for (const char* const text : {"setAttr ", "setAttr -s ", "setAttr -k ", "setAttr \".tan\" ",
                                 "setAttr \".ktv\"", "setAttr \".ktv\" 1 "}) {
    SCOPED_TRACE(text);
    EXPECT_EQ(Read("createNode animCurveTL -n \"a\";\n" + std::string(text)), 1289986);
    EXPECT_THAT(Messages(), ElementsAre(kUnexpectedEndText));
  }
}

TEST_F(KeysTest, TheEndAfterManyKeysIsAnUnexpectedEndToo) {
  std::string text = "createNode animCurveTL -n \"a\";\nsetAttr -s 999999999 \".ktv\"";
  for (int key = 0; key < 1000; ++key) text += " " + std::to_string(key) + " 5";
  EXPECT_EQ(Read(text + " "), 1289986);
  EXPECT_THAT(Messages(), ElementsAre(kUnexpectedEndText));
}

}  // namespace
}  // namespace testsupport

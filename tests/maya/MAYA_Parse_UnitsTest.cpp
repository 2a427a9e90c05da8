// "currentUnit".
#include "hostapi/ErrorCodes.h"
#include "hostutil/HostSetup.h"
#include "tests/support/ReaderFixture.h"

namespace testsupport {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

class UnitsTest : public ReaderTest {
 protected:
  // Reads a currentUnit command over settings that are not the defaults: foot, radian, 48 frames per second.
  HostError ReadOver(std::string_view arguments) {
    return Read("currentUnit -l ft -a rad -t 48;\ncurrentUnit " + std::string(arguments) + ";\n");
  }

  void ExpectUnits(std::int32_t linear, std::int32_t angle, std::int32_t time, double rate) {
    EXPECT_EQ(scene().linearUnit, linear);
    EXPECT_EQ(scene().angleUnit, angle);
    EXPECT_EQ(scene().timeUnit, time);
    EXPECT_DOUBLE_EQ(scene().frameRate, rate);
  }
};

struct UnitRow {
  const char* word;
  std::int32_t code;
};

const UnitRow kLinearUnits[] = {{"mm", 1}, {"millimeter", 1}, {"cm", 2}, {"centimeter", 2},
                                {"m", 3},  {"meter", 3},      {"km", 4}, {"kilometer", 4},
                                {"in", 5}, {"inch", 5},       {"ft", 6}, {"foot", 6},
                                {"yd", 7}, {"yard", 7},       {"mi", 8}, {"mile", 8}};
const UnitRow kAngleUnits[] = {{"deg", 1}, {"degree", 1}, {"rad", 2}, {"radian", 2}};
const UnitRow kTimeUnits[] = {{"hour", 1}, {"min", 2},   {"sec", 3},   {"millisec", 4},
                              {"game", 5}, {"film", 6},  {"pal", 7},   {"ntsc", 8},
                              {"show", 9}, {"palf", 10}, {"ntscf", 11}};

TEST_F(UnitsTest, EveryLinearUnitInAnyCase) {
  for (const UnitRow& row : kLinearUnits)
    for (const std::string& word : CaseChanges(row.word))
      for (const char* const option : {"-l", "-linear", "-L", "-LINEAR"}) {
        SCOPED_TRACE(option + word);
        ASSERT_EQ(ReadOver(option + (" " + word)), 0);
        ExpectUnits(row.code, 2, 12, 48);
      }
}

TEST_F(UnitsTest, EveryAngleUnitInAnyCase) {
  for (const UnitRow& row : kAngleUnits)
    for (const std::string& word : CaseChanges(row.word))
      for (const char* const option : {"-a", "-angle", "-A", "-Angle"}) {
        SCOPED_TRACE(option + word);
        ASSERT_EQ(ReadOver(option + (" " + word)), 0);
        ExpectUnits(6, row.code, 12, 48);
      }
}

TEST_F(UnitsTest, EveryTimeUnitInAnyCaseLeavesTheRate) {
  for (const UnitRow& row : kTimeUnits)
    for (const std::string& word : CaseChanges(row.word))
      for (const char* const option : {"-t", "-time", "-T", "-tIME"}) {
        SCOPED_TRACE(option + word);
        ASSERT_EQ(ReadOver(option + (" " + word)), 0);
        ExpectUnits(6, 2, row.code, 48);
      }
}

TEST_F(UnitsTest, ANumberIsAFrameRate) {
  struct Row {
    const char* number;
    double rate;
  };
  for (const Row& row : {Row{"25", 25}, Row{"23.976fps", 23.976}, Row{"29.97df", 29.97}, Row{"40fps", 40},
                         Row{"-5", -5}, Row{".5", 0.5}, Row{"0", 0}, Row{"6e1", 60}}) {
    SCOPED_TRACE(row.number);
    ASSERT_EQ(Read("currentUnit -t " + std::string(row.number) + ";\n"), 0);
    ExpectUnits(2, 1, 12, row.rate);
  }
}

TEST_F(UnitsTest, AllThreeUnitsOfOneCommand) {
  ASSERT_EQ(Read("currentUnit -l centimeter -a degree -t film;\n"), 0);
  ExpectUnits(2, 1, 6, 29.97);
  ASSERT_EQ(Read("currentUnit -time ntsc -linear inch -angle radian;\n"), 0);
  ExpectUnits(5, 2, 8, 29.97);
}

TEST_F(UnitsTest, UnknownWordsAreIgnored) {
  ASSERT_EQ(ReadOver("-l furlong -a degree"), 0);
  ExpectUnits(6, 1, 12, 48);
  ASSERT_EQ(ReadOver("-l degree -a film -t cm"), 0);
  ExpectUnits(6, 2, 12, 48);
  ASSERT_EQ(ReadOver("-l inches -a degrees -t fil -t fps"), 0);
  ExpectUnits(6, 2, 12, 48);
}

TEST_F(UnitsTest, LaterCommandsOverrideFieldByField) {
  ASSERT_EQ(Read("currentUnit -l m -t film;\ncurrentUnit -a rad;\ncurrentUnit -t pal;\ncurrentUnit;\n"), 0);
  ExpectUnits(3, 2, 7, 29.97);
  ASSERT_EQ(Read("currentUnit -t 30 -t film -l mm -l yd;\n"), 0);
  ExpectUnits(7, 1, 6, 30);
}

TEST_F(UnitsTest, WhatIsNoWordIsDropped) {
  for (const char* const dropped : {"\"m\"", "5", "-x", "file", ":", "/*c*/", "("}) {
    SCOPED_TRACE(dropped);
    const std::string token(dropped);
    ASSERT_EQ(ReadOver("-l " + token + " m -a " + token + " deg"), 0);
    ExpectUnits(6, 2, 12, 48);
  }
  for (const char* const dropped : {"\"film\"", "-x", "file", ":", "/*c*/"}) {
    ASSERT_EQ(ReadOver("-t " + std::string(dropped) + " pal"), 0);
    ExpectUnits(6, 2, 12, 48);
  }
}

TEST_F(UnitsTest, AnOptionInPlaceOfAWordIsDroppedItself) {
  ASSERT_EQ(ReadOver("-l -a deg -t pal"), 0);
  ExpectUnits(6, 2, 7, 48);
}

TEST_F(UnitsTest, ASemicolonInPlaceOfAValueEndsTheCommand) {
  for (const char* const option : {"-l", "-linear", "-a", "-angle", "-t", "-time"}) {
    ASSERT_EQ(Read("currentUnit " + std::string(option) + "; -l m -a rad -t pal;\n"), 0) << option;
    ExpectUnits(2, 1, 3, 29.97);
  }
}

TEST_F(UnitsTest, OtherOptionsAndTokensAreIgnored) {
  ASSERT_EQ(ReadOver("-u mm -linears m -ll km m pal 5 \"x\" ( /*c*/"), 0);
  ExpectUnits(6, 2, 12, 48);
  ASSERT_EQ(ReadOver("-" + std::string(254, 'l') + " m"), 0);
  ExpectUnits(6, 2, 12, 48);
}

TEST_F(UnitsTest, AFailedScanThrowsItsCodeWithTheTimeCodeSet) {
  struct Row {
    std::string number;
    HostError code;
  };
  for (const Row& row :
       {Row{"--x", HOST_ERR_NUMBER_SYNTAX}, Row{"1e999", HOST_ERR_NUMBER_RANGE},
        Row{"0x10", HOST_ERR_NUMBER_SYNTAX}, Row{std::string(255, '1'), HOST_ERR_NUMBER_SYNTAX},
        Row{"24fps2", HOST_ERR_NUMBER_SYNTAX}}) {
    SCOPED_TRACE(row.number);
    EXPECT_EQ(Read("currentUnit -l m -t film;\ncurrentUnit -l km -t " + row.number + " -a rad;\n"), row.code);
    ExpectUnits(4, 1, 12, 29.97);
    EXPECT_THAT(Messages(), IsEmpty());
  }
}

TEST_F(UnitsTest, AWordOf255BytesReadsAsEmpty) {
  ASSERT_EQ(ReadOver("-l m" + std::string(254, 'm')), 0);
  ExpectUnits(6, 2, 12, 48);
}

TEST_F(UnitsTest, TheEndInsideTheCommandIsAnUnexpectedEndAndKeepsWhatWasRead) {
  for (const char* const text : {"currentUnit -l m ", "currentUnit -l m -a ", "currentUnit -l m -t ",
                                 "currentUnit -l m -x ", "currentUnit -l m -l "}) {
    SCOPED_TRACE(text);
    EXPECT_EQ(Read(text), 1289986);
    EXPECT_THAT(Messages(), ElementsAre(kUnexpectedEndText));
    ExpectUnits(3, 1, 3, 29.97);
  }
}

}  // namespace
}  // namespace testsupport

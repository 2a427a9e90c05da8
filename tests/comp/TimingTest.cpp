#include "plugin/Globals.h"
#include "tests/support/BuilderFixture.h"
#include "tests/support/BuilderScene.h"

using namespace mayaimport;

namespace testsupport {
namespace {

// What each time unit gives to key times, to the duration and to the frame rate.
struct RateRow {
  std::int32_t timeUnit;
  std::uint32_t keyScale;
  bool frameBased;
  std::uint32_t durationScale;
  HostRatio frameRate;
};

constexpr RateRow kRateRows[] = {
    {0, 1000, false, 1000, {30, 1}},
    {1, 3600000, false, 3600000, {30, 1}},
    {2, 60000, false, 60000, {30, 1}},
    {3, 1000, false, 1000, {30, 1}},
    {4, 1, false, 1, {30, 1}},
    {5, 15000, false, 15000, {15, 1}},
    {6, 24000, true, 24000, {24, 1}},
    {7, 25000, true, 25000, {25, 1}},
    {8, 30000, true, 30000, {30, 1}},
    {9, 48000, true, 48000, {48, 1}},
    {10, 50000, true, 50000, {50, 1}},
    {11, 60000, true, 60000, {60, 1}},
    {12, 23976, true, 23976, {23976, 1000}},
    {13, 1000, false, 1000, {30, 1}},
    {-1, 1000, false, 1000, {30, 1}},
};

class TimingTest : public BuilderTest {
 protected:
  TimingTest() { Begin(); }

  void UseRate(const RateRow& row) {
    parser().timeUnit = row.timeUnit;
    parser().frameRate = 23.976;
    MAYA_Parse::ResetOffset();
  }
};

TEST_F(TimingTest, EveryTimeUnitHasItsScaleOfKeyTimes) {
  for (const RateRow& row : kRateRows) {
    UseRate(row);
    EXPECT_EQ(parser().ConvertTime(3.0, 0), (T_Time{3000, row.keyScale})) << "time unit " << row.timeUnit;
  }
}

TEST_F(TimingTest, TheFirstKeyOfAFrameBasedSceneBecomesTimeZero) {
  for (const RateRow& row : kRateRows) {
    UseRate(row);
    const T_Time expected{row.frameBased ? 0 : 5000, row.keyScale};
    EXPECT_EQ(parser().ConvertTime(5.0, 1), expected) << "time unit " << row.timeUnit;
    const T_Time later{row.frameBased ? 2000 : 7000, row.keyScale};
    EXPECT_EQ(parser().ConvertTime(7.0, 0), later) << "time unit " << row.timeUnit;
  }
}

TEST_F(TimingTest, AnyNonZeroFlagMarksTheFirstKey) {
  parser().timeUnit = 6;
  EXPECT_EQ(parser().ConvertTime(4.0, 255), (T_Time{0, 24000}));
}

TEST_F(TimingTest, EveryFurtherFirstKeyMovesTheOffsetAnew) {
  parser().timeUnit = 6;
  EXPECT_EQ(parser().ConvertTime(10.0, 1), (T_Time{0, 24000}));
  EXPECT_EQ(parser().ConvertTime(3.0, 1), (T_Time{0, 24000}));
  EXPECT_EQ(parser().ConvertTime(10.0, 0), (T_Time{7000, 24000}));
}

TEST_F(TimingTest, TheOffsetIsSharedByAllParsersUntilItIsReset) {
  parser().timeUnit = 6;
  parser().ConvertTime(10.0, 1);
  MAYA_Parse other(host().basicSuite(), "");
  other.timeUnit = 3;
  EXPECT_EQ(other.ConvertTime(12.0, 0), (T_Time{2000, 1000}));
  MAYA_Parse::ResetOffset();
  EXPECT_EQ(other.ConvertTime(12.0, 0), (T_Time{12000, 1000}));
}

TEST_F(TimingTest, AKeyAtOneHourComesOutAtOneThreeThousandSixHundredthOfASecond) {
  parser().timeUnit = 1;
  EXPECT_EQ(parser().ConvertTime(1.0, 0), (T_Time{1000, 3600000}));
}

TEST_F(TimingTest, MillisecondsHaveTheScaleOne) {
  parser().timeUnit = 4;
  EXPECT_EQ(parser().ConvertTime(2.0, 0), (T_Time{2000, 1}));
}

TEST_F(TimingTest, GameIsARateThatDoesNotMoveTheOffset) {
  parser().timeUnit = 5;
  EXPECT_EQ(parser().ConvertTime(8.0, 1), (T_Time{8000, 15000}));
  EXPECT_EQ(parser().ConvertTime(9.0, 0), (T_Time{9000, 15000}));
}

TEST_F(TimingTest, AFilmSceneWhoseFirstKeyIsAtFrameOneHasFrameTwentyFiveAtOneSecond) {
  parser().timeUnit = 6;
  EXPECT_EQ(parser().ConvertTime(1.0, 1), (T_Time{0, 24000}));
  EXPECT_EQ(parser().ConvertTime(25.0, 0), (T_Time{24000, 24000}));
}

TEST_F(TimingTest, AKeyHalfWayBetweenTwoValuesRoundsUp) {
  EXPECT_EQ(parser().ConvertTime(0.0005, 0).value, 1);
  EXPECT_EQ(parser().ConvertTime(0.00049, 0).value, 0);
  EXPECT_EQ(parser().ConvertTime(2.0625, 0).value, 2063);
}

TEST_F(TimingTest, ANegativeTimeTruncatesTowardZero) {
  EXPECT_EQ(parser().ConvertTime(-0.0007, 0).value, 0);
  EXPECT_EQ(parser().ConvertTime(-0.0016, 0).value, -1);
  EXPECT_EQ(parser().ConvertTime(-2.0, 0).value, -1999);
}

TEST_F(TimingTest, TimesBeyondThirtyTwoBitsAreHeldAtTheEndsOfTheRange) {
  EXPECT_EQ(parser().ConvertTime(1e9, 0).value, 2147483647);
  EXPECT_EQ(parser().ConvertTime(-1e9, 0).value, -2147483647 - 1);
  EXPECT_EQ(parser().ConvertTime(1e308, 0).value, 2147483647);
}

TEST_F(TimingTest, ACustomRateThatIsNotPositiveGivesKeyTimesAndDurationTheFallback) {
  parser().timeUnit = 12;
  for (const double rate : {0.0, -24.0}) {
    parser().frameRate = rate;
    MAYA_Parse::ResetOffset();
    EXPECT_EQ(parser().ConvertTime(1.0, 0), (T_Time{1000, 29970})) << rate;
  }
}

TEST_F(TimingTest, TheFrameRateDoesNotFallBackWhenTheCustomRateIsNotPositive) {
  parser().timeUnit = 12;
  parser().frameRate = 0.0;
  EXPECT_EQ(parser().FindFrameRate(), (HostRatio{0, 1000}));
  parser().frameRate = -24.5;
  EXPECT_EQ(parser().FindFrameRate(), (HostRatio{-24500, 1000}));
}

TEST_F(TimingTest, ACustomRateIsTruncatedToThousandths) {
  parser().timeUnit = 12;
  parser().frameRate = 12.3459;
  EXPECT_EQ(parser().ConvertTime(1.0, 0), (T_Time{1000, 12345}));
  EXPECT_EQ(parser().FindFrameRate(), (HostRatio{12345, 1000}));
}

TEST_F(TimingTest, EveryTimeUnitHasItsFrameRate) {
  for (const RateRow& row : kRateRows) {
    UseRate(row);
    EXPECT_EQ(parser().FindFrameRate(), row.frameRate) << "time unit " << row.timeUnit;
  }
}

TEST_F(TimingTest, ASceneThatNamesNoUnitHasFactorOneAndThirtyFrames) {
  parser().timeUnit = 0;
  EXPECT_EQ(parser().ConvertTime(1.5, 1), (T_Time{1500, 1000}));
  EXPECT_EQ(parser().FindFrameRate(), (HostRatio{30, 1}));
}

TEST_F(TimingTest, ASceneWithoutCurvesLastsTenSecondsWhateverItsUnits) {
  for (const RateRow& row : kRateRows) {
    UseRate(row);
    EXPECT_EQ(parser().FindLongestAnimation(), (T_Time{29970, 2997})) << "time unit " << row.timeUnit;
  }
}

TEST_F(TimingTest, EveryTimeUnitHasItsScaleOfTheDuration) {
  Begin(Animation("a.tx", {{1.0, 0.0}, {40.0, 1.0}}));
  for (const RateRow& row : kRateRows) {
    UseRate(row);
    EXPECT_EQ(parser().FindLongestAnimation(), (T_Time{40000, row.durationScale}))
        << "time unit " << row.timeUnit;
  }
  parser().timeUnit = 12;
  parser().frameRate = 0.0;
  EXPECT_EQ(parser().FindLongestAnimation(), (T_Time{40000, 29970}));
}

TEST_F(TimingTest, TheDurationIsTheLatestLastKeyOfAllCurves) {
  Begin(Animation("a.tx", {{0.0, 0.0}, {7.0, 0.0}}) + Animation("a.ty", {{0.0, 0.0}, {31.25, 0.0}}) +
        Animation("a.tz", {{0.0, 0.0}, {12.0, 0.0}}));
  EXPECT_EQ(parser().FindLongestAnimation(), (T_Time{31250, 1000}));
}

TEST_F(TimingTest, TheDurationLooksAtTheLastKeyByPositionNotAtTheLatest) {
  Begin(Animation("a.tx", {{50.0, 0.0}, {20.0, 0.0}}));
  EXPECT_EQ(parser().FindLongestAnimation(), (T_Time{20000, 1000}));
}

TEST_F(TimingTest, ACurveWithoutKeysDoesNotCountForTheDuration) {
  Begin(Animation("a.tx", {}) + Animation("a.ty", {{0.0, 0.0}, {3.0, 0.0}}));
  EXPECT_EQ(parser().FindLongestAnimation(), (T_Time{3000, 1000}));
}

TEST_F(TimingTest, CurvesThatAllEndAtZeroOrBeforeLastTenUnitsFromTheOffset) {
  Begin(Animation("a.tx", {{-5.0, 0.0}, {0.0, 1.0}}) + Animation("a.ty", {{-9.0, 0.0}}));
  parser().timeUnit = 6;
  EXPECT_EQ(parser().FindLongestAnimation(), (T_Time{10000, 24000}));
  parser().ConvertTime(4.0, 1);
  EXPECT_EQ(parser().FindLongestAnimation(), (T_Time{6000, 24000}));
}

TEST_F(TimingTest, TheDurationIsMeasuredFromTheOffsetAndLeavesIt) {
  Begin(Animation("a.tx", {{0.0, 0.0}, {48.0, 1.0}}));
  parser().timeUnit = 6;
  parser().ConvertTime(12.0, 1);
  EXPECT_EQ(parser().FindLongestAnimation(), (T_Time{36000, 24000}));
  EXPECT_DOUBLE_EQ(G_time_offsetD, 12.0);
}

TEST_F(TimingTest, PixelAspectsNearOneAreSquare) {
  parser().pixelAspect = 1.009;
  EXPECT_EQ(parser().FindPixelAspectRatio(), (HostRatio{1000, 1000}));
  parser().pixelAspect = 0.991;
  EXPECT_EQ(parser().FindPixelAspectRatio(), (HostRatio{1000, 1000}));
  parser().pixelAspect = 1.01;
  EXPECT_EQ(parser().FindPixelAspectRatio(), (HostRatio{1010, 1000}));
  parser().pixelAspect = 0.9;
  EXPECT_EQ(parser().FindPixelAspectRatio(), (HostRatio{900, 1000}));
}

TEST_F(TimingTest, PixelAspectsAreTruncatedToThousandths) {
  parser().pixelAspect = 0.9091;
  EXPECT_EQ(parser().FindPixelAspectRatio(), (HostRatio{909, 1000}));
  parser().pixelAspect = -1.2347;
  EXPECT_EQ(parser().FindPixelAspectRatio(), (HostRatio{-1234, 1000}));
  parser().pixelAspect = 1e300;
  EXPECT_EQ(parser().FindPixelAspectRatio(), (HostRatio{2147483647, 1000}));
}

TEST_F(TimingTest, TheHorizontalScaleFactorIsThePixelAspectBitForBit) {
  for (const double aspect : {0.9091, 1.005, -2.0, 0.0}) {
    parser().pixelAspect = aspect;
    EXPECT_EQ(parser().CalculateHSF(), aspect);
  }
}

}  // namespace
}  // namespace testsupport

// What docs/peculiarities.md says about units, rates and keys, seen from outside.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "hostapi/ErrorCodes.h"
#include "tests/docs/SceneImport.h"

// As GoogleTest prints and compares them.
static bool operator==(const T_Time& a, const T_Time& b) { return a.value == b.value && a.scale == b.scale; }
static bool operator==(const HostRatio& a, const HostRatio& b) {
  return a.numerator == b.numerator && a.denominator == b.denominator;
}

namespace docs_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

constexpr double kTolerance = 1e-9;

refhost::HostOptions LinearUnits() {
  refhost::HostOptions options;
  options.linearUnits = 1;
  return options;
}

// A camera that moves 3 units along X.
std::string Moving(const std::string& unit, const std::string& times) {
  return Scene("currentUnit -t " + unit + ";" + Camera() + Curve("k", times) + Drive("k", "cam.tx"));
}

double PositionX(const std::string& unit, const std::string& distance) {
  const SceneImport import(Scene("currentUnit -l " + unit + ";" +
                                 Camera("setAttr \".t\" -type \"double3\" " + distance + " 0 0;")),
                           LinearUnits());
  return import.Value("camShape", kPosition);
}

const refhost::Composition& OnlyComposition(const SceneImport& import) {
  EXPECT_EQ(import.project().compositions().size(), 1u);
  return import.project().compositions().at(0);
}

TEST(TimingPeculiarities, HoursMinutesAndMillisecondsAreUsedAsRates) {
  EXPECT_EQ(SceneImport(Moving("hour", "1 0 2 3")).KeyTime("camShape", kPosition, 0),
            (T_Time{1000, 3600000}));
  EXPECT_EQ(SceneImport(Moving("min", "1 0 2 3")).KeyTime("camShape", kPosition, 0), (T_Time{1000, 60000}));
  EXPECT_EQ(SceneImport(Moving("millisec", "1 0 2 3")).KeyTime("camShape", kPosition, 0), (T_Time{1000, 1}));
}

TEST(TimingPeculiarities, GameSceneIsNotMovedToTimeZero) {
  EXPECT_EQ(SceneImport(Moving("game", "10 0 20 3")).KeyTime("camShape", kPosition, 0),
            (T_Time{10000, 15000}));
  EXPECT_EQ(SceneImport(Moving("film", "10 0 20 3")).KeyTime("camShape", kPosition, 0), (T_Time{0, 24000}));
}

TEST(TimingPeculiarities, UnitsThatAreNoRateGiveThirtyFramesPerSecond) {
  for (const char* unit : {"hour", "min", "sec", "millisec", "ntsc"}) {
    const SceneImport import(Moving(unit, "1 0 2 3"));
    EXPECT_EQ(OnlyComposition(import).frameRate, (HostRatio{30, 1})) << unit;
  }
}

TEST(TimingPeculiarities, CustomRateOfZeroIsPassedOn) {
  {
    const SceneImport refused(Moving("0", "1 0 2 3"));
    EXPECT_EQ(refused.result().code, HOST_ERR_BAD_RATIO);
    EXPECT_THAT(refused.project().compositions(), IsEmpty());
  }
  refhost::HostOptions permissive;
  permissive.permissive = true;
  const SceneImport recorded(Moving("0", "1 0 2 3"), permissive);
  EXPECT_EQ(OnlyComposition(recorded).frameRate, (HostRatio{0, 1000}));
  EXPECT_EQ(recorded.KeyTime("camShape", kPosition, 1), (T_Time{1000, 29970}));
}

TEST(TimingPeculiarities, MetreComesOutAHundredTimesTooLarge) {
  EXPECT_NEAR(PositionX("m", "1") / PositionX("cm", "100"), 100.0, kTolerance);
}

TEST(TimingPeculiarities, KilometreLacksTheStepFromCentimetresToInches) {
  EXPECT_NEAR(PositionX("km", "1") / PositionX("cm", "100000"), 2.54, kTolerance);
}

TEST(TimingPeculiarities, DistancesStandAsTheyAreUnlessThePreferenceIsOn) {
  const SceneImport import(Scene("currentUnit -l m;" + Camera("setAttr \".t\" -type \"double3\" 7 0 0;")));
  EXPECT_NEAR(import.Value("camShape", kPosition), 7.0, kTolerance);
}

TEST(TimingPeculiarities, SceneInRadiansHardlyTurns) {
  const SceneImport import(
      Scene("currentUnit -a radian;" + Camera("setAttr \".r\" -type \"double3\" 1 0 0;")));
  EXPECT_NEAR(import.Value("camShape", kRotationX), 0.017453292519943295, kTolerance);
}

TEST(TimingPeculiarities, EveryNodeStartsAtTimeZero) {
  const SceneImport import(
      Scene("createNode transform -n \"rig\";\n"
            "createNode transform -n \"cam\" -p \"rig\";\ncreateNode camera -n \"camShape\" -p \"cam\";\n" +
            Curve("a", "10 0 11 1") + Curve("b", "100 0 101 1") + Curve("lens", "50 35 51 70") +
            Drive("a", "cam.tx") + Drive("b", "rig.tx") + Drive("lens", "camShape.fl")));
  for (const auto& [layer, stream] :
       {std::pair("camShape", kPosition), std::pair("rig", kPosition), std::pair("camShape", kZoom)}) {
    EXPECT_EQ(import.KeyTime(layer, stream, 0), (T_Time{0, 24000})) << layer;
    EXPECT_EQ(import.KeyTime(layer, stream, 1), (T_Time{1000, 24000})) << layer;
  }
}

TEST(TimingPeculiarities, DurationCountsFromFrameZero) {
  const SceneImport import(Moving("pal", "1001 0 1024 3"));
  EXPECT_EQ(OnlyComposition(import).duration, (T_Time{1024000, 25000}));
  EXPECT_EQ(import.KeyTime("camShape", kPosition, 1), (T_Time{23000, 25000}));
}

TEST(TimingPeculiarities, DurationIsThatOfTheLastKeyByPosition) {
  EXPECT_EQ(OnlyComposition(SceneImport(Moving("film", "20 0 5 3"))).duration, (T_Time{5000, 24000}));
}

TEST(TimingPeculiarities, SceneWithoutCurvesLastsTenSecondsAndOneWithoutLaterKeysTenFrames) {
  {
    const SceneImport still(Scene(Camera()));
    EXPECT_EQ(OnlyComposition(still).duration, (T_Time{29970, 2997}));
  }
  {
    const SceneImport atZero(Moving("film", "-5 0 0 3"));
    EXPECT_EQ(OnlyComposition(atZero).duration, (T_Time{10000, 24000}));
  }
}

TEST(TimingPeculiarities, ConstantCurveLendsItsTimeToTheFirstKey) {
  const SceneImport import(Scene(Camera() + Curve("still", "10 4") + Curve("moving", "5 0 6 3") +
                                 Drive("still", "cam.tx") + Drive("moving", "cam.ty")));
  EXPECT_EQ(import.KeyTime("camShape", kPosition, 0), (T_Time{-3999, 24000}));
  EXPECT_EQ(import.KeyTime("camShape", kPosition, 1), (T_Time{0, 24000}));
}

TEST(TimingPeculiarities, OneKeyAnimatesAFocalLengthAndNoTransform) {
  const SceneImport import(Scene(Camera() + Curve("lens", "5 70") + Curve("still", "5 4") +
                                 Drive("lens", "camShape.fl") + Drive("still", "cam.tx")));
  EXPECT_EQ(import.KeyCount("camShape", kZoom), 1u);
  EXPECT_EQ(import.KeyCount("camShape", kPosition), 0u);
  EXPECT_NEAR(import.Value("camShape", kPosition), 0.0, kTolerance);
}

TEST(TimingPeculiarities, OneKeyGivesItsValueToEveryKeyOfAnAnimatedTransform) {
  const SceneImport import(Scene(Camera() + Curve("moving", "5 0 6 3") + Curve("still", "5 4") +
                                 Drive("moving", "cam.tx") + Drive("still", "cam.ty")));
  ASSERT_EQ(import.KeyCount("camShape", kPosition), 2u);
  EXPECT_NEAR(import.KeyValue("camShape", kPosition, 0, 1), -4.0, kTolerance);
  EXPECT_NEAR(import.KeyValue("camShape", kPosition, 1, 1), -4.0, kTolerance);
}

TEST(TimingPeculiarities, UnequalKeyCountsStopTheImportWithAMessageAboutACamera) {
  const SceneImport import(
      Scene(Camera() + "createNode transform -n \"t\";\ncreateNode locator -n \"null1\" -p \"t\";\n" +
            Curve("a", "1 0 2 1 3 2") + Curve("b", "1 0 2 1") + Drive("a", "t.tx") + Drive("b", "t.sz")));
  EXPECT_EQ(import.result().code, HOST_ERR_MAYA_KEY_COUNTS);
  EXPECT_THAT(import.result().messages, ElementsAre("Inconsistant number of keyframes for Maya camera."));
}

TEST(TimingPeculiarities, KeysAreMatchedByPositionAndNotByTime) {
  const SceneImport import(Scene(Camera() + Curve("a", "1 0 2 1") + Curve("b", "1 5 9 6") +
                                 Drive("a", "cam.tx") + Drive("b", "cam.ty")));
  ASSERT_EQ(import.KeyCount("camShape", kPosition), 2u);
  EXPECT_EQ(import.KeyTime("camShape", kPosition, 1), (T_Time{1000, 24000}));
  EXPECT_NEAR(import.KeyValue("camShape", kPosition, 1, 1), -6.0, kTolerance);
}

TEST(TimingPeculiarities, RotationRunsOnPastAFullTurn) {
  const SceneImport import(
      Scene(Camera() + Curve("turn", "1 0 2 -100 3 -200 4 -300 5 -400") + Drive("turn", "cam.rz")));
  EXPECT_NEAR(import.KeyValue("camShape", kRotationZ, 4), 400.0, kTolerance);
}

}  // namespace
}  // namespace docs_test

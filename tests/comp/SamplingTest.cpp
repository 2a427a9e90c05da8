#include <cstring>

#include "hostutil/HostSetup.h"
#include "hostutil/RecordList.h"
#include "plugin/Globals.h"
#include "tests/support/BuilderFixture.h"
#include "tests/support/BuilderRun.h"
#include "tests/support/BuilderScene.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using ::testing::ElementsAre;

constexpr const char* kInconsistentText = "Inconsistant number of keyframes for Maya camera.";
constexpr const char* kPlugs[] = {"n.tx", "n.ty", "n.tz", "n.rx", "n.ry", "n.rz", "n.sx", "n.sy", "n.sz"};

class SamplingTest : public BuilderTest {
 protected:
  // A node "n" and its curves.
  void Use(const std::string& curves, std::string_view units = "-t film") {
    Begin(SceneHead(units) + TransformText("n") + curves);
    node_ = TransformAt(0);
  }

  std::vector<double> Extracted(std::int32_t group, std::int32_t n) {
    double values[3] = {-101.0, -102.0, -103.0};
    parser().ExtractAnimInfo(&node_, group, n, values);
    return {values[0], values[1], values[2]};
  }

  MAYA_Transform node_{};
};

TEST_F(SamplingTest, ANodeWithoutCurvesSharesNoKeys) {
  Use("");
  EXPECT_EQ(parser().VerifyAnimInfo(&node_), 0);
  EXPECT_THAT(Extracted(0, 3), ElementsAre(-101.0, -102.0, -103.0));
}

TEST_F(SamplingTest, EachOfTheNineChannelsCountsForTheNode) {
  for (const char* const plug : kPlugs) {
    Use(Animation(plug, KeysFrom(1, {1, 2, 3})));
    EXPECT_EQ(parser().VerifyAnimInfo(&node_), 3) << plug;
  }
}

TEST_F(SamplingTest, EachChannelIsReadInItsGroupAndAxis) {
  std::string curves;
  for (int i = 0; i < 9; ++i) curves += Animation(kPlugs[i], KeysFrom(1, {10.0 + i, 20.0 + i}));
  Use(curves);
  EXPECT_THAT(Extracted(0, 0), ElementsAre(10, 11, 12));
  EXPECT_THAT(Extracted(1, 0), ElementsAre(13, 14, 15));
  EXPECT_THAT(Extracted(2, 0), ElementsAre(16, 17, 18));
  EXPECT_THAT(Extracted(2, 1), ElementsAre(26, 27, 28));
}

TEST_F(SamplingTest, AConstantChannelLendsItsOneValueToEveryKeyAndTheOthersKeepTheirs) {
  Use(Animation("n.tx", KeysFrom(1, {1, 2, 3, 4, 5})) + Animation("n.ry", {{1, 77}}));
  EXPECT_EQ(parser().VerifyAnimInfo(&node_), 5);
  for (std::int32_t n = 0; n < 5; ++n) {
    EXPECT_THAT(Extracted(1, n), ElementsAre(-101.0, 77.0, -103.0));
    EXPECT_THAT(Extracted(0, n), ElementsAre(n + 1.0, -102.0, -103.0));
  }
}

TEST_F(SamplingTest, DifferentCountsAreReportedWithTheCamerasTextWhateverTheNodeIs) {
  Use(Animation("n.tx", KeysFrom(1, {1, 2, 3, 4, 5})) + Animation("n.sz", KeysFrom(1, {1, 2, 3, 4})));
  EXPECT_EQ(CodeOf([&] { parser().VerifyAnimInfo(&node_); }), 1289987);
  EXPECT_THAT(End().messages, ElementsAre(kInconsistentText));
}

TEST_F(SamplingTest, DifferentCountsAreReportedBeforeALaterCurveIsLookedAt) {
  Use(Animation("n.tx", KeysFrom(1, {1, 2})) + Animation("n.ty", KeysFrom(1, {1, 2, 3})));
  node_.curve[2] = 4711;
  EXPECT_EQ(CodeOf([&] { parser().VerifyAnimInfo(&node_); }), 1289987);
}

TEST_F(SamplingTest, ACurveOfOneKeyNeitherSetsNorChecksTheCount) {
  Use(Animation("n.tx", {{1, 5}}));
  EXPECT_EQ(parser().VerifyAnimInfo(&node_), 0);
  Use(Animation("n.tx", {{1, 5}}) + Animation("n.ty", KeysFrom(1, {1, 2, 3})));
  EXPECT_EQ(parser().VerifyAnimInfo(&node_), 3);
  Use(Animation("n.tx", KeysFrom(1, {1, 2, 3})) + Animation("n.ty", {{1, 5}}) + Animation("n.sz", {}));
  EXPECT_EQ(parser().VerifyAnimInfo(&node_), 3);
}

TEST_F(SamplingTest, TheConstraintLinksAreNoChannels) {
  Use(Animation("n.tx", KeysFrom(1, {1, 2})));
  node_.curve[9] = node_.curve[10] = node_.curve[11] = 4711;
  EXPECT_EQ(parser().VerifyAnimInfo(&node_), 2);
}

TEST_F(SamplingTest, ACurveIndexPastTheListIsTheListsCodeWithoutAMessage) {
  Use(Animation("n.tx", KeysFrom(1, {1, 2})));
  node_.curve[8] = 1;
  EXPECT_EQ(CodeOf([&] { parser().VerifyAnimInfo(&node_); }), HOST_ERR_LIST_INDEX);
  EXPECT_TRUE(End().messages.empty());
}

TEST_F(SamplingTest, KeyZeroOfAFilmSceneIsTimeZeroAndTheNextAFrameLater) {
  Use(Animation("n.tx", KeysFrom(10, {1, 2})));
  EXPECT_EQ(parser().GetKeyTime(&node_, 0), (T_Time{0, 24000}));
  EXPECT_EQ(parser().GetKeyTime(&node_, 1), (T_Time{1000, 24000}));
}

TEST_F(SamplingTest, EveryTimeUnitGivesKeyTimesItsScale) {
  constexpr std::pair<const char*, T_Time> kRows[] = {
      {"hour", {11000, 3600000}}, {"min", {11000, 60000}},  {"sec", {11000, 1000}},
      {"millisec", {11000, 1}},   {"game", {11000, 15000}}, {"film", {1000, 24000}},
      {"pal", {1000, 25000}},     {"ntsc", {1000, 30000}},  {"show", {1000, 48000}},
      {"palf", {1000, 50000}},    {"ntscf", {1000, 60000}}, {"23.976fps", {1000, 23976}},
      {"0", {1000, 29970}},
  };
  for (const auto& [unit, expected] : kRows) {
    MAYA_Parse::ResetOffset();
    Use(Animation("n.tx", KeysFrom(10, {1, 2})), std::string("-t ") + unit);
    parser().GetKeyTime(&node_, 0);
    EXPECT_EQ(parser().GetKeyTime(&node_, 1), expected) << unit;
  }
}

TEST_F(SamplingTest, TheFirstCurveWithAKeyOfThatNumberGivesTheTime) {
  Use(Animation("n.tx", {}) + Animation("n.ty", {{100, 1}}) + Animation("n.rz", KeysFrom(20, {1, 2})) +
      Animation("n.sx", KeysFrom(30, {1, 2})));
  EXPECT_EQ(parser().GetKeyTime(&node_, 0), (T_Time{0, 24000}));
  EXPECT_DOUBLE_EQ(G_time_offsetD, 100.0);
}

TEST_F(SamplingTest, AConstantChannelThatLendsTheFirstTimeCanPutLaterKeysBeforeZero) {
  Use(Animation("n.ty", {{100, 1}}) + Animation("n.rz", KeysFrom(20, {1, 2})));
  EXPECT_EQ(parser().GetKeyTime(&node_, 0), (T_Time{0, 24000}));
  EXPECT_EQ(parser().GetKeyTime(&node_, 1), (T_Time{-78999, 24000}));
}

TEST_F(SamplingTest, WithoutACurveTheTimeIsZeroOverOneAndTheOffsetStays) {
  Use(Animation("n.tx", KeysFrom(10, {1, 2})));
  G_time_offsetD = 3.5;
  EXPECT_EQ(parser().GetKeyTime(&node_, 2), (T_Time{0, 1}));
  const MAYA_Transform still = DefaultTransform();
  EXPECT_EQ(parser().GetKeyTime(&still, 0), (T_Time{0, 1}));
  EXPECT_DOUBLE_EQ(G_time_offsetD, 3.5);
}

TEST_F(SamplingTest, OnlyKeyZeroMovesTheOffset) {
  Use(Animation("n.tx", KeysFrom(10, {1, 2, 3})));
  parser().GetKeyTime(&node_, 2);
  EXPECT_DOUBLE_EQ(G_time_offsetD, 0.0);
  parser().GetKeyTime(&node_, 0);
  EXPECT_DOUBLE_EQ(G_time_offsetD, 10.0);
}

TEST_F(SamplingTest, AGameSceneKeepsTheOffset) {
  Use(Animation("n.tx", KeysFrom(10, {1, 2})), "-t game");
  EXPECT_EQ(parser().GetKeyTime(&node_, 0), (T_Time{10000, 15000}));
}

TEST_F(SamplingTest, ACurveAfterTheOneThatGivesTheTimeIsNotLookedAt) {
  Use(Animation("n.tx", KeysFrom(10, {1, 2})));
  node_.curve[1] = 4711;
  EXPECT_EQ(CodeOf([&] { parser().GetKeyTime(&node_, 0); }), 0);
}

TEST_F(SamplingTest, KeysAreMatchedByNumberNotByTime) {
  Use(Animation("n.tx", KeysFrom(1, {1, 2, 3})) + Animation("n.ty", {{100, 7}, {200, 8}, {50, 9}}));
  EXPECT_EQ(parser().VerifyAnimInfo(&node_), 3);
  EXPECT_THAT(Extracted(0, 2), ElementsAre(3.0, 9.0, -103.0));
  parser().GetKeyTime(&node_, 0);
  EXPECT_EQ(parser().GetKeyTime(&node_, 2), (T_Time{2000, 24000}));
}

TEST_F(SamplingTest, ValuesComeRawWithoutUnits) {
  G_use_linear_unitsL = 1;
  Use(Animation("n.tx", KeysFrom(1, {1.5, 2})) + Animation("n.rx", KeysFrom(1, {2.5, 3})), "-l m -a rad");
  EXPECT_THAT(Extracted(0, 0), ElementsAre(1.5, -102.0, -103.0));
  EXPECT_THAT(Extracted(1, 0), ElementsAre(2.5, -102.0, -103.0));
}

TEST_F(SamplingTest, AKeyBeyondACurvesLastIsTheListsCodeAndTheAxesBeforeItStayWritten) {
  Use(Animation("n.tx", KeysFrom(1, {1, 2, 3})) + Animation("n.ty", KeysFrom(1, {4, 5})));
  double values[3] = {-101.0, -102.0, -103.0};
  EXPECT_EQ(CodeOf([&] { parser().ExtractAnimInfo(&node_, 0, 2, values); }), HOST_ERR_LIST_INDEX);
  EXPECT_THAT(values, ElementsAre(3.0, -102.0, -103.0));
}

TEST_F(SamplingTest, ACurveIndexPastTheListIsFoundAfterTheAxesBeforeItAreWritten) {
  Use(Animation("n.tx", KeysFrom(1, {1, 2, 3})));
  node_.curve[1] = 4711;
  double values[3] = {-101.0, -102.0, -103.0};
  EXPECT_EQ(CodeOf([&] { parser().ExtractAnimInfo(&node_, 0, 0, values); }), HOST_ERR_LIST_INDEX);
  EXPECT_THAT(values, ElementsAre(1.0, -102.0, -103.0));
}

TEST_F(SamplingTest, ExtractingAGroupLooksAtNoOtherGroup) {
  Use(Animation("n.tx", KeysFrom(1, {1, 2, 3})));
  node_.curve[3] = 4711;
  EXPECT_THAT(Extracted(0, 1), ElementsAre(2.0, -102.0, -103.0));
}

// The lists that are read show whether a value is what VerifyAnimInfo found or is fetched anew.
class RememberedSamplingTest : public SamplingTest {
 protected:
  // Two nodes of different curves and key times, "a" and "b".
  void UseTwo() {
    Begin(SceneHead("-t sec") + TransformText("a") + TransformText("b") +
          Animation("a.tx", KeysFrom(10, {1, 2, 3})) + Animation("a.ry", {{10, 77}}) +
          Animation("b.ty", KeysFrom(20, {4, 5})));
    node_ = TransformAt(0);
    other_ = TransformAt(1);
  }

  // Begins to sample "a".
  void Remember() {
    ASSERT_EQ(parser().VerifyAnimInfo(&node_), 3);
    ASSERT_EQ(parser().GetKeyTime(&node_, 0), (T_Time{10000, 1000}));
  }

  // Checks key 1 of "a", and says how many records of lists that took.
  std::int64_t ReadsOfKeyOne(const MAYA_Transform& node) {
    const std::int64_t before = HostUtilityCallCount(HOST_UTILITY_ListGet);
    EXPECT_EQ(parser().GetKeyTime(&node, 1), (T_Time{11000, 1000}));
    double values[3] = {-101.0, -102.0, -103.0};
    parser().ExtractAnimInfo(&node, kRotateGroup, 1, values);
    EXPECT_THAT(values, ElementsAre(-101.0, 77.0, -103.0));
    parser().ExtractAnimInfo(&node, kTranslateGroup, 1, values);
    EXPECT_THAT(values, ElementsAre(2.0, 77.0, -103.0));
    return HostUtilityCallCount(HOST_UTILITY_ListGet) - before;
  }

  static constexpr std::int64_t kReadsWithoutMemory = 6;  // a curve and a key, three times

  MAYA_Transform other_{};
};

TEST_F(RememberedSamplingTest, ANodeThatWasVerifiedIsReadWithoutItsCurves) {
  UseTwo();
  EXPECT_EQ(ReadsOfKeyOne(node_), kReadsWithoutMemory);
  Remember();
  EXPECT_EQ(ReadsOfKeyOne(node_), 0);
}

TEST_F(RememberedSamplingTest, KeyZeroFetchesTheKeysOfEachChannelAtOnce) {
  UseTwo();
  ASSERT_EQ(parser().VerifyAnimInfo(&node_), 3);
  EXPECT_EQ(ReadsOfKeyOne(node_), kReadsWithoutMemory);
  const std::int64_t before = HostUtilityCallCount(HOST_UTILITY_ListGet);
  parser().GetKeyTime(&node_, 0);
  EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_ListGet) - before, 2);
}

TEST_F(RememberedSamplingTest, TheSameCurvesAtAnotherAddressAreRecognised) {
  UseTwo();
  Remember();
  MAYA_Transform copy = DefaultTransform();
  std::memcpy(copy.curve, node_.curve, sizeof copy.curve);
  copy.curve[kTargetSlot] = 1;
  EXPECT_EQ(ReadsOfKeyOne(copy), 0);
}

TEST_F(RememberedSamplingTest, OtherCurvesAtTheSameAddressAreNotTakenForTheNode) {
  UseTwo();
  Remember();
  node_ = other_;
  EXPECT_EQ(parser().GetKeyTime(&node_, 1), (T_Time{21000, 1000}));
  EXPECT_THAT(Extracted(kTranslateGroup, 1), ElementsAre(-101.0, 5.0, -103.0));
}

TEST_F(RememberedSamplingTest, AnotherNodeInBetweenChangesNothing) {
  UseTwo();
  Remember();
  EXPECT_EQ(parser().GetKeyTime(&other_, 0), (T_Time{20000, 1000}));
  EXPECT_EQ(parser().GetKeyTime(&other_, 1), (T_Time{21000, 1000}));
  double values[3] = {-101.0, -102.0, -103.0};
  parser().ExtractAnimInfo(&other_, kTranslateGroup, 0, values);
  EXPECT_THAT(values, ElementsAre(-101.0, 4.0, -103.0));
  EXPECT_EQ(ReadsOfKeyOne(node_), 0);
}

TEST_F(RememberedSamplingTest, TheNodeVerifiedLastIsTheOneRemembered) {
  UseTwo();
  Remember();
  ASSERT_EQ(parser().VerifyAnimInfo(&other_), 2);
  EXPECT_EQ(ReadsOfKeyOne(node_), kReadsWithoutMemory);
}

TEST_F(RememberedSamplingTest, AVerificationThatThrowsLeavesNothingRemembered) {
  const auto verify = [&] { parser().VerifyAnimInfo(&other_); };
  UseTwo();
  Remember();
  other_.curve[0] = 4711;
  EXPECT_EQ(CodeOf(verify), HOST_ERR_LIST_INDEX);
  EXPECT_EQ(ReadsOfKeyOne(node_), kReadsWithoutMemory);

  Remember();
  other_ = node_;
  other_.curve[5] = 2;  // two keys, not three
  EXPECT_EQ(CodeOf(verify), 1289987);
  EXPECT_EQ(ReadsOfKeyOne(node_), kReadsWithoutMemory);
}

TEST_F(RememberedSamplingTest, AFailedReadWhileTheSameNodeIsVerifiedAgainLeavesNothingRemembered) {
  UseTwo();
  Remember();
  const HostUtilityFailure failure{HOST_UTILITY_ListGet, HostUtilityCallCount(HOST_UTILITY_ListGet) + 2, -77,
                                   HOST_THROW_NOTHING};
  ASSERT_EQ(HostAddUtilityFailure(&failure), 0);
  EXPECT_EQ(CodeOf([&] { parser().VerifyAnimInfo(&node_); }), -77);
  EXPECT_EQ(ReadsOfKeyOne(node_), kReadsWithoutMemory);
  HostClearUtilityFailures();
}

TEST_F(RememberedSamplingTest, AFailedRunLeavesTheOffsetAndTheKeysAreStillRead) {
  Begin(SceneHead("-t film") + TransformText("a") + Animation("a.tx", KeysFrom(10, {1, 2})) +
        Animation("a.ty", KeysFrom(10, {3, 4})));
  node_ = TransformAt(0);
  ASSERT_EQ(parser().VerifyAnimInfo(&node_), 2);
  const HostUtilityFailure failure{HOST_UTILITY_ListGet, HostUtilityCallCount(HOST_UTILITY_ListGet) + 2, -77,
                                   HOST_THROW_NOTHING};
  ASSERT_EQ(HostAddUtilityFailure(&failure), 0);
  EXPECT_EQ(CodeOf([&] { parser().GetKeyTime(&node_, 0); }), -77);
  HostClearUtilityFailures();
  EXPECT_DOUBLE_EQ(G_time_offsetD, 0.0);
  EXPECT_THAT(Extracted(kTranslateGroup, 1), ElementsAre(2.0, 4.0, -103.0));
}

TEST_F(RememberedSamplingTest, KeysThatAreReadAfterwardsAreSeen) {
  Begin(SceneHead("-t sec") + TransformText("a") + Animation("a.tx", KeysFrom(10, {1, 2})));
  node_ = TransformAt(0);
  ASSERT_EQ(parser().VerifyAnimInfo(&node_), 2);
  parser().GetKeyTime(&node_, 0);
  // The curve, which is still current, takes the keys of its command once more.
  parser().position = std::strstr(parser().buffer, "\".ktv");
  ASSERT_NE(parser().position, nullptr);
  parser().ParseAnimSetAttr();
  const std::int64_t before = HostUtilityCallCount(HOST_UTILITY_ListGet);
  EXPECT_EQ(parser().GetKeyTime(&node_, 1), (T_Time{11000, 1000}));
  EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_ListGet) - before, 2)
      << "the curve, and the key where it lies now";
  EXPECT_EQ(parser().GetKeyTime(&node_, 3), (T_Time{11000, 1000}));
  EXPECT_THAT(Extracted(kTranslateGroup, 2), ElementsAre(1.0, -102.0, -103.0));
}

}  // namespace
}  // namespace testsupport

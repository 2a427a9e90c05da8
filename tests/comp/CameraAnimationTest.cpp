#include "hostutil/HostSetup.h"
#include "plugin/Globals.h"
#include "tests/support/BuilderFixture.h"
#include "tests/support/BuilderRun.h"
#include "tests/support/BuilderScene.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::SizeIs;

constexpr double kNear = 1e-9;

class CameraAnimationTest : public BuilderTest {
 protected:
  // A transform "rig" and a camera "lens" under it, and curves.
  void Use(const std::string& curves, refhost::HostOptions options = {}, std::string_view units = "-t film") {
    Begin(SceneHead(units) + TransformText("rig") + CameraText("lens", "Rig") + curves, options);
  }

  void Apply() {
    const MAYA_Camera camera = CameraAt(0);
    parser().ApplyCameraAnimation(NewCamera(), &camera);
  }
};

TEST_F(CameraAnimationTest, ACameraThatIsNotAnimatedGetsNoKeys) {
  Use("");
  Apply();
  EXPECT_THAT(TakeTrace(), IsEmpty());
}

TEST_F(CameraAnimationTest, AFocalLengthCurveWithoutKeysIsNone) {
  Use(Animation("lens.fl", {}));
  Apply();
  EXPECT_THAT(TakeTrace(), IsEmpty());
}

TEST_F(CameraAnimationTest, AFocalLengthOfOneKeyGivesOneZoomKeyAtTimeZero) {
  Use(Animation("lens.fl", {{17, 35}}));
  Apply();
  EXPECT_THAT(KeyTimes(kZoom), ElementsAre(T_Time{0, 24000}));
}

TEST_F(CameraAnimationTest, AFocalLengthOfThirtyFiveHasTheZoomOfTheDefaultFilm) {
  Use(Animation("lens.fl", {{1, 35}, {2, 70}}));
  Apply();
  const std::vector<double> zooms = KeyValues(kZoom);
  ASSERT_EQ(zooms.size(), 2u);
  const double expected = 720 * 0.9091 * (35.0 * 72.0 / 25.4) / (1.4173 * 72.0);
  EXPECT_NEAR(zooms[0], expected, kNear);
  EXPECT_NEAR(zooms[0], 636.38, 0.005);
  EXPECT_NEAR(zooms[1], 2.0 * expected, kNear);
}

// The bits are those of the still lens; every other order of the factors gives others.
TEST_F(CameraAnimationTest, AZoomKeyIsTheImageSizeTimesTheFocalLengthByTheFilmSizeToTheBit) {
  Begin(SceneHead() + RenderSize(1280, 720, 1.0667) + CameraText("lens", "rig") +
        "\tsetAttr \".cap\" 1.6735 1;\n" + Animation("lens.fl", {{1, 34.7}}));
  Apply();
  EXPECT_THAT(KeyValues(kZoom), ElementsAre(0x1.16a6efcb8d015p+10));
}

TEST_F(CameraAnimationTest, AVerticalFitMeasuresTheHeight) {
  Begin(SceneHead() + CameraText("lens", "rig") + "\tsetAttr \".ff\" 2;\n" + Animation("lens.fl", {{1, 50}}));
  Apply();
  EXPECT_NEAR(KeyValues(kZoom)[0], 486 * (50.0 * 72.0 / 25.4) / (0.9449 * 72.0), kNear);
}

TEST_F(CameraAnimationTest, TheZoomStreamIsHeldWhileItsKeysAreAddedAndReleasedAfterTheBatch) {
  Use(Animation("lens.fl", {{1, 35}, {2, 70}}));
  Apply();
  std::vector<std::string> calls;
  for (const std::string& line : TakeTrace()) {
    calls.emplace_back(Field(line, "call"));
    const std::string_view stream = Field(line, "stream");
    EXPECT_TRUE(stream.empty() || stream == "\"stream:1\"") << line;
  }
  EXPECT_THAT(calls,
              ElementsAre("\"AcquireLayerStream\"", "\"GetStreamKeyframeCount\"", "\"BeginKeyframeBatch\"",
                          "\"AddBatchKeyframe\"", "\"SetBatchKeyframeValue\"", "\"AddBatchKeyframe\"",
                          "\"SetBatchKeyframeValue\"", "\"EndKeyframeBatch\"", "\"ReleaseStream\""));
}

TEST_F(CameraAnimationTest, ZoomAndTransformKeysAreEachTimedFromTheirOwnFirstKey) {
  std::vector<double> values(30, 40.0);
  Use(Animation("lens.fl", KeysFrom(100, values)) + Animation("rig.tx", KeysFrom(7, values)));
  Apply();
  for (const int id : {kZoom, kPosition}) {
    const std::vector<T_Time> times = KeyTimes(id);
    ASSERT_EQ(times.size(), 30u);
    EXPECT_EQ(times.front(), (T_Time{0, 24000}));
    EXPECT_EQ(times.back(), (T_Time{29000, 24000}));
  }
  EXPECT_DOUBLE_EQ(G_time_offsetD, 7.0);
}

TEST_F(CameraAnimationTest, InAGameSceneTheZoomKeysStayWhereTheyAre) {
  Use(Animation("lens.fl", KeysFrom(100, {35, 36})), {}, "-t game");
  Apply();
  EXPECT_THAT(KeyTimes(kZoom), ElementsAre(T_Time{100000, 15000}, T_Time{101000, 15000}));
}

TEST_F(CameraAnimationTest, ACameraWithoutATransformGetsItsZoomKeysAndNoError) {
  Begin(SceneHead() + CameraText("lens", "nobody") + Animation("lens.fl", {{1, 35}, {2, 70}}));
  EXPECT_EQ(CodeOf([&] { Apply(); }), 0);
  EXPECT_EQ(StreamOf(kZoom).keyCount(), 2u);
}

TEST_F(CameraAnimationTest, AZoomThatAlreadyHasKeysIsLeftAloneUnreleasedAndTheTransformIsStillAnimated) {
  refhost::HostOptions options;
  options.zoomKeys = 3;
  Use(Animation("lens.fl", {{1, 35}, {2, 70}}) + Animation("rig.tx", KeysFrom(1, {1, 2})), options);
  Apply();
  EXPECT_EQ(StreamOf(kZoom).keyCount(), 3u);
  EXPECT_EQ(StreamOf(kPosition).keyCount(), 2u);
  std::vector<std::string> released;
  for (const std::string& line : CallsOf(TakeTrace(), "ReleaseStream")) {
    released.emplace_back(Field(line, "stream"));
  }
  EXPECT_THAT(released, ::testing::Not(::testing::Contains("\"stream:1\"")));
  const refhost::CallbackResult result = End();
  ASSERT_EQ(result.leftovers.size(), 1u);
  EXPECT_TRUE(result.leftovers[0].keptByDesign);
}

TEST_F(CameraAnimationTest, TheZoomKeysAreCountedAgainBeforeEachAndAFailedCountKeepsThoseBefore) {
  const std::int32_t service = HOST_UTILITY_ListCount;
  for (std::size_t added = 0; added <= 3; ++added) {
    SCOPED_TRACE(added);
    Use(Animation("lens.fl", {{1, 35}, {2, 70}, {3, 50}}));
    // The first count asks whether there is a key at all.
    const std::int64_t nth = HostUtilityCallCount(service) + 2 + static_cast<std::int64_t>(added);
    const HostUtilityFailure failure{service, nth, 4242, HOST_THROW_NOTHING};
    ASSERT_EQ(HostAddUtilityFailure(&failure), 0);
    EXPECT_EQ(CodeOf([&] { Apply(); }), 4242);
    HostClearUtilityFailures();
    EXPECT_EQ(StreamOf(kZoom).keyCount(), added);
    EXPECT_THAT(CallsOf(TakeTrace(), "ReleaseStream"), SizeIs(1));
  }
}

TEST_F(CameraAnimationTest, ACurveIndexPastTheListIsTheListsCode) {
  Use(Animation("rig.tx", {}));
  MAYA_Camera camera = CameraAt(0);
  camera.focalLengthCurve = 4711;
  VOR_Layer* const layer = NewCamera();
  EXPECT_EQ(CodeOf([&] { parser().ApplyCameraAnimation(layer, &camera); }), HOST_ERR_LIST_INDEX);
  EXPECT_THAT(TakeTrace(), IsEmpty());
}

}  // namespace
}  // namespace testsupport

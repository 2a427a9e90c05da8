#include "plugin/Globals.h"
#include "tests/support/BuilderFixture.h"
#include "tests/support/BuilderRun.h"
#include "tests/support/BuilderScene.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

// Records by index.
constexpr std::int32_t kRig = 0;
constexpr std::int32_t kTarget = 1;
constexpr std::int32_t kConstraint = 2;

class LookAtTest : public BuilderTest {
 protected:
  void Use(const std::string& targetCurves = "", std::string_view units = "-t film") {
    Begin(SceneHead(units) + TransformText("rig") + TransformText("target") + Triple(".t", 1, 2, 3) +
          Triple(".r", 10, 20, 30) + Triple(".s", 4, 5, 6) + Triple(".rp", 7, 8, 9) + Triple(".sp", 7, 8, 9) +
          ConstraintText("aim") + CameraText("lens", "RIG") + Aim("aim", "rig", "target") + targetCurves);
    constraint_ = TransformAt(kConstraint);
    camera_ = CameraAt(0);
  }

  bool LookAt() { return parser().SetCameraLookAt(NewCamera(), &camera_, &constraint_); }

  MAYA_Transform constraint_{};
  MAYA_Camera camera_{};
};

TEST_F(LookAtTest, TheThreeLinksAreThoseOfTheConnections) {
  Use();
  EXPECT_EQ(constraint_.curve[9], kRig);
  EXPECT_EQ(constraint_.curve[10], kTarget);
  EXPECT_EQ(constraint_.curve[11], kRig);
}

TEST_F(LookAtTest, TheCameraIsAimedAtTheTargetsTranslate) {
  Use();
  EXPECT_TRUE(LookAt());
  EXPECT_THAT(StreamOf(kAnchor).value, ElementsAre(1.0, -2.0, -3.0));
  EXPECT_TRUE(host().project().layers().back().aimed);
  EXPECT_EQ(StreamOf(kAnchor).keyCount(), 0u);
}

TEST_F(LookAtTest, AConstraintOfAnotherTransformLeavesTheLayerUntouchedAndGivesFalse) {
  Use();
  constraint_.curve[11] = kTarget;
  EXPECT_FALSE(LookAt());
  EXPECT_THAT(TakeTrace(), IsEmpty());
}

TEST_F(LookAtTest, ATargetThatMovesKeysThePointOfInterestFromItsTranslateAlone) {
  Use(Animation("target.tx", KeysFrom(10, {5, 6, 7})) + Animation("target.rx", KeysFrom(10, {0, 90, 180})) +
      Animation("target.sx", KeysFrom(10, {1, 2, 3})));
  EXPECT_TRUE(LookAt());
  EXPECT_THAT(KeyTimes(kAnchor), ElementsAre(T_Time{0, 24000}, T_Time{1000, 24000}, T_Time{2000, 24000}));
  EXPECT_THAT(KeyValues(kAnchor, 0), ElementsAre(5.0, 6.0, 7.0));
  EXPECT_THAT(KeyValues(kAnchor, 1), ElementsAre(-2.0, -2.0, -2.0));
  EXPECT_THAT(KeyValues(kAnchor, 2), ElementsAre(-3.0, -3.0, -3.0));
  for (const int id : {kPosition, kScale, kXRotation, kYRotation, kZRotation}) {
    EXPECT_EQ(StreamOf(id).keyCount(), 0u) << "stream " << id;
  }
}

TEST_F(LookAtTest, EveryAxisOfAMovingTargetIsKeyedInItsOwnDirection) {
  Use(Animation("target.tx", KeysFrom(1, {5, 6})) + Animation("target.ty", KeysFrom(1, {7, 8})) +
      Animation("target.tz", KeysFrom(1, {9, 11})));
  EXPECT_TRUE(LookAt());
  EXPECT_THAT(KeyValues(kAnchor, 0), ElementsAre(5.0, 6.0));
  EXPECT_THAT(KeyValues(kAnchor, 1), ElementsAre(-7.0, -8.0));
  EXPECT_THAT(KeyValues(kAnchor, 2), ElementsAre(-9.0, -11.0));
}

TEST_F(LookAtTest, AChannelOfOneKeyGivesThatToEveryKeyOfThePoint) {
  Use(Animation("target.tx", {{1, 55}}) + Animation("target.ty", KeysFrom(1, {7, 8})) +
      Animation("target.tz", {{1, 66}}));
  EXPECT_TRUE(LookAt());
  EXPECT_THAT(StreamOf(kAnchor).value, ElementsAre(1.0, -2.0, -3.0));
  EXPECT_THAT(KeyValues(kAnchor, 0), ElementsAre(55.0, 55.0));
  EXPECT_THAT(KeyValues(kAnchor, 1), ElementsAre(-7.0, -8.0));
  EXPECT_THAT(KeyValues(kAnchor, 2), ElementsAre(-66.0, -66.0));
}

TEST_F(LookAtTest, ATargetThatOnlyTurnsStillKeysThePointWhereItStands) {
  Use(Animation("target.ry", KeysFrom(1, {0, 45})));
  EXPECT_TRUE(LookAt());
  EXPECT_THAT(KeyValues(kAnchor, 0), ElementsAre(1.0, 1.0));
}

TEST_F(LookAtTest, TheFlagComesBeforeTheValueAndTheValueBeforeTheKeys) {
  Use(Animation("target.tx", KeysFrom(1, {5, 6})));
  EXPECT_TRUE(LookAt());
  std::vector<std::string> calls;
  for (const std::string& line : TakeTrace()) calls.emplace_back(Field(line, "call"));
  EXPECT_THAT(calls, ElementsAre("\"SetLayerFlag\"", "\"AcquireLayerStream\"", "\"SetStreamValue\"",
                                 "\"ReleaseStream\"", "\"AcquireLayerStream\"", "\"BeginKeyframeBatch\"",
                                 "\"ReleaseStream\"", "\"AcquireLayerStream\"", "\"AddBatchKeyframe\"",
                                 "\"SetBatchKeyframeValue\"", "\"ReleaseStream\"", "\"AcquireLayerStream\"",
                                 "\"AddBatchKeyframe\"", "\"SetBatchKeyframeValue\"", "\"ReleaseStream\"",
                                 "\"EndKeyframeBatch\""));
}

TEST_F(LookAtTest, ThePointIsConvertedAsADistance) {
  G_use_linear_unitsL = 1;
  Use(Animation("target.tx", KeysFrom(1, {5, 6})), "-l in -t film");
  EXPECT_TRUE(LookAt());
  EXPECT_THAT(StreamOf(kAnchor).value, ElementsAre(72.0, -144.0, -216.0));
  EXPECT_THAT(KeyValues(kAnchor, 0), ElementsAre(360.0, 432.0));
}

TEST_F(LookAtTest, AnIndexOutOfRangeIsTheListsCode) {
  Use();
  constraint_.curve[11] = 4711;
  EXPECT_EQ(CodeOf([&] { LookAt(); }), HOST_ERR_LIST_INDEX);
  constraint_.curve[11] = kRig;
  constraint_.curve[10] = 4711;
  EXPECT_EQ(CodeOf([&] { LookAt(); }), HOST_ERR_LIST_INDEX);
  EXPECT_THAT(TakeTrace(), IsEmpty());
}

TEST_F(LookAtTest, ATargetWithDifferentCountsOfKeysIsThrownAfterItsStaticPointIsSet) {
  Use(Animation("target.tx", KeysFrom(1, {5, 6})) + Animation("target.ty", KeysFrom(1, {5, 6, 7})));
  EXPECT_EQ(CodeOf([&] { LookAt(); }), 1289987);
  EXPECT_THAT(StreamOf(kAnchor).value, ElementsAre(1.0, -2.0, -3.0));
}

TEST_F(LookAtTest, AnUnanimatedNodeOpensNoBatch) {
  Use();
  const MAYA_Transform target = TransformAt(kTarget);
  parser().ApplyAnchorPointAnimation(NewCamera(), &target);
  EXPECT_THAT(TakeTrace(), IsEmpty());
}

// The aim pass over all constraints of a scene.
class AimPassTest : public ::testing::Test {};

std::string AimedScene(const std::string& more) {
  return SceneHead() + RenderSize(640, 480) + TransformText("rig") + CameraText("lens", "rig") +
         TransformText("t1") + Triple(".t", 1, 0, 0) + TransformText("t2") + Triple(".t", 2, 0, 0) + more;
}

double InterestX(const ImportRun& run) { return FindLayer(*run.host, "lens")->findStream(kAnchor)->value[0]; }

TEST_F(AimPassTest, TheFirstConstraintInListOrderWithAllThreeLinksAims) {
  const ImportRun run =
      ImportText(AimedScene(ConstraintText("a1") + ConstraintText("a2") + ConstraintText("a3") +
                            "connectAttr \"t1.t\" \"a1.target[0].targetTranslate\";\n" +  // two links missing
                            Aim("a3", "rig", "t1") + Aim("a2", "rig", "t2")));
  EXPECT_EQ(run.result.code, 0);
  EXPECT_DOUBLE_EQ(InterestX(run), 2.0);
}

TEST_F(AimPassTest, EachOfTheThreeLinksIsNeeded) {
  const std::string links[] = {"connectAttr \"rig.t\" \"a1.ct\";\n",
                               "connectAttr \"t2.t\" \"a1.target[0].targetTranslate\";\n",
                               "connectAttr \"a1.cr\" \"rig.r\";\n"};
  for (int left = 0; left < 3; ++left) {
    std::string scene = AimedScene(ConstraintText("a1"));
    for (int i = 0; i < 3; ++i) {
      if (i != left) scene += links[i];
    }
    const ImportRun run = ImportText(scene);
    EXPECT_EQ(run.result.code, 0) << "without link " << left;
    EXPECT_FALSE(FindLayer(*run.host, "lens")->aimed) << "without link " << left;
  }
}

TEST_F(AimPassTest, AConstraintOfAnotherTransformIsPassedOver) {
  const ImportRun run = ImportText(AimedScene(ConstraintText("a1") + Aim("a1", "t2", "t1") +
                                              ConstraintText("a2") + Aim("a2", "rig", "t2")));
  EXPECT_DOUBLE_EQ(InterestX(run), 2.0);
}

TEST_F(AimPassTest, AWeightThatIsConnectedLastMakesTheConstraintItsOwnTarget) {
  const ImportRun run =
      ImportText(AimedScene(ConstraintText("a1") + Triple(".t", 50, 60, 70) + Aim("a1", "rig", "t1") +
                            "connectAttr \"a1.rigW0\" \"a1.target[0].targetWeight\";\n"));
  EXPECT_TRUE(FindLayer(*run.host, "lens")->aimed);
  EXPECT_DOUBLE_EQ(InterestX(run), 50.0);
}

TEST_F(AimPassTest, LocatorsAreNotAimed) {
  const ImportRun run =
      ImportText(SceneHead() + RenderSize(640, 480) + TransformText("rig") + CameraText("lens", "other") +
                 LocatorText("nullShape", "rig") + TransformText("t1") + Triple(".t", 1, 0, 0) +
                 ConstraintText("a1") + Aim("a1", "rig", "t1"));
  ASSERT_NE(FindLayer(*run.host, "nullShape"), nullptr);
  EXPECT_FALSE(FindLayer(*run.host, "nullShape")->aimed);
  EXPECT_FALSE(FindLayer(*run.host, "lens")->aimed);
}

TEST_F(AimPassTest, SeveralCamerasAreEachAimedByTheirOwn) {
  const ImportRun run =
      ImportText(AimedScene(TransformText("rig2") + CameraText("lens2", "rig2") + ConstraintText("a2") +
                            Aim("a2", "rig2", "t2") + ConstraintText("a1") + Aim("a1", "rig", "t1")));
  EXPECT_DOUBLE_EQ(InterestX(run), 1.0);
  EXPECT_DOUBLE_EQ(FindLayer(*run.host, "lens2")->findStream(kAnchor)->value[0], 2.0);
}

}  // namespace
}  // namespace testsupport

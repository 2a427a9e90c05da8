// What docs/peculiarities.md says about compositions and layers, and about failures, seen from outside.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <csignal>

#include "hostapi/CameraSuite.h"
#include "hostapi/ErrorCodes.h"
#include "tests/docs/SceneImport.h"

namespace docs_test {
namespace {

using testing::IsEmpty;
using testing::SizeIs;

constexpr double kTolerance = 1e-9;
constexpr HostError kRehearsedCode = 4711;

refhost::HostOptions Failing(const std::string& operation, std::int64_t nth) {
  refhost::HostOptions options;
  refhost::Failure failure;
  failure.operation = operation;
  failure.nth = nth;
  failure.code = kRehearsedCode;
  options.failures.push_back(failure);
  return options;
}

// A camera, a target under a still parent, and a constraint with these connections.
std::string Aimed(const std::string& connections) {
  return Scene(Camera() +
               "createNode transform -n \"car\";\n  setAttr \".t\" -type \"double3\" 100 0 0;\n"
               "createNode transform -n \"target\" -p \"car\";\n"
               "  setAttr \".t\" -type \"double3\" 1 2 3;\n"
               "createNode aimConstraint -n \"aim\" -p \"cam\";\n"
               "connectAttr \"cam.t\" \"aim.constraintTranslate\";\n" +
               connections);
}

constexpr const char* kTurns = "connectAttr \"aim.constraintRotateX\" \"cam.rx\";\n";
constexpr const char* kLooksAt = "connectAttr \"target.t\" \"aim.target[0].targetTranslate\";\n";
constexpr const char* kWeighs = "connectAttr \"aim.cameraW0\" \"aim.target[0].targetWeight\";\n";

TEST(LayerPeculiarities, SceneWithoutCamerasMakesNothing) {
  const SceneImport import(Scene("createNode locator -n \"null1\";"));
  EXPECT_EQ(import.result().code, 0);
  EXPECT_THAT(import.result().messages, IsEmpty());
  EXPECT_THAT(import.project().compositions(), IsEmpty());
}

TEST(LayerPeculiarities, CameraNamedPerspShapeGivesNoLayer) {
  const SceneImport import(Scene("createNode camera -n \"PERSPshape\";"));
  EXPECT_THAT(import.project().compositions(), SizeIs(1));
  EXPECT_THAT(import.project().layers(), IsEmpty());
}

TEST(LayerPeculiarities, LocatorNeedsNullInItsOwnName) {
  const SceneImport import(Scene(
      Camera() +
      "createNode transform -n \"null1\";\ncreateNode locator -n \"locatorShape1\" -p \"null1\";\n"
      "createNode locator -n \"aNullB\"; createNode locator -n \"x_NULL\"; createNode locator -n \"null_y\";"
      "createNode locator -n \"nULL\";"));
  EXPECT_EQ(import.LayersNamed("locatorShape1"), 0u);
  EXPECT_EQ(import.LayersNamed("nULL"), 0u);
  EXPECT_THAT(import.project().layers(), SizeIs(4));
}

TEST(LayerPeculiarities, SceneThatSaysNothingHasPixelsThatAreNotSquare) {
  const SceneImport import("//Maya ASCII\ncreateNode camera -n \"c\";\n");
  ASSERT_THAT(import.project().compositions(), SizeIs(2));
  EXPECT_EQ(import.project().compositions()[0].name, "Square shot");
  EXPECT_EQ(import.project().compositions()[0].width, 654);
  EXPECT_EQ(import.project().compositions()[1].name, "shot");
  EXPECT_EQ(import.project().compositions()[1].width, 720);
  EXPECT_EQ(import.project().compositions()[1].pixelAspect.numerator, 909);
}

TEST(LayerPeculiarities, PixelAspectWithinAHundredthOfOneIsSquare) {
  {
    const SceneImport square(Scene("setAttr \".pa\" 1.009;" + Camera()));
    EXPECT_THAT(square.project().compositions(), SizeIs(1));
  }
  {
    const SceneImport notSquare(Scene("setAttr \".pa\" 1.011;" + Camera()));
    EXPECT_THAT(notSquare.project().compositions(), SizeIs(2));
  }
}

TEST(LayerPeculiarities, FilmFitOtherThanVerticalCountsAsHorizontal) {
  for (const char* fit : {"0", "1", "3"}) {
    const SceneImport import(Scene(Camera() + "setAttr \".ff\" " + fit + ";"));
    EXPECT_EQ(import.Layer("camShape")->filmDirection, HOST_FILM_HORIZONTAL) << fit;
  }
  const SceneImport vertical(Scene(Camera() + "setAttr \".ff\" 2;"));
  EXPECT_EQ(vertical.Layer("camShape")->filmDirection, HOST_FILM_VERTICAL);
}

TEST(LayerPeculiarities, RotateOrderIsNotLookedAt) {
  const std::string turned = "setAttr \".r\" -type \"double3\" 10 20 30;";
  for (const char* order : {"", "setAttr \".ro\" 3;"}) {
    const SceneImport import(Scene(Camera(turned + order)));
    EXPECT_NEAR(import.Value("camShape", kRotationX), 10.0, kTolerance) << order;
    EXPECT_NEAR(import.Value("camShape", kRotationY), -20.0, kTolerance) << order;
    EXPECT_NEAR(import.Value("camShape", kRotationZ), -30.0, kTolerance) << order;
  }
}

TEST(LayerPeculiarities, UnknownParentGivesOneNullAndEndsTheChain) {
  const SceneImport import(
      Scene("createNode transform -n \"cam\" -p \"|world|rig\";\ncreateNode camera -n \"c\" -p \"cam\";"));
  EXPECT_THAT(import.project().layers(), SizeIs(2));
  EXPECT_EQ(import.Layer("c")->parent, import.Layer("|world|rig"));
}

TEST(LayerPeculiarities, ParentThatWasUsedBeforeEndsTheChain) {
  const SceneImport import(
      Scene("createNode transform -n \"rig\"; createNode transform -n \"a\" -p \"b\";"
            "createNode transform -n \"b\" -p \"a\"; createNode camera -n \"c\" -p \"a\";"));
  EXPECT_EQ(import.result().code, 0);
  EXPECT_THAT(import.project().layers(), SizeIs(2));
  EXPECT_EQ(import.LayersNamed("b"), 1u);
}

TEST(LayerPeculiarities, NullIsNamedAsTheChildNamesItsParent) {
  const SceneImport import(
      Scene("createNode transform -n \"rig\"; createNode transform -n \"cam\" -p \"RIG\";"
            "createNode camera -n \"c\" -p \"cam\";"));
  EXPECT_EQ(import.LayersNamed("RIG"), 1u);
  EXPECT_EQ(import.LayersNamed("rig"), 0u);
}

TEST(LayerPeculiarities, EveryLayerHasParentNullsOfItsOwn) {
  const SceneImport import(
      Scene("createNode transform -n \"rig\";"
            "createNode transform -n \"l\" -p \"rig\"; createNode camera -n \"lc\" -p \"l\";"
            "createNode transform -n \"r\" -p \"rig\"; createNode camera -n \"rc\" -p \"r\";"));
  EXPECT_EQ(import.LayersNamed("rig"), 2u);
  EXPECT_NE(import.Layer("lc")->parent, import.Layer("rc")->parent);
}

TEST(LayerPeculiarities, AimedCameraLooksAtTheTargetsOwnTranslate) {
  const SceneImport import(Aimed(std::string(kTurns) + kWeighs + kLooksAt));
  EXPECT_TRUE(import.Layer("camShape")->aimed);
  EXPECT_NEAR(import.Value("camShape", kPointOfInterest, 0), 1.0, kTolerance);
  EXPECT_NEAR(import.Value("camShape", kPointOfInterest, 1), -2.0, kTolerance);
  EXPECT_NEAR(import.Value("camShape", kPointOfInterest, 2), -3.0, kTolerance);
}

TEST(LayerPeculiarities, WeightWiredLastMakesTheConstraintItsOwnTarget) {
  const SceneImport import(Aimed(std::string(kTurns) + kLooksAt + kWeighs));
  EXPECT_TRUE(import.Layer("camShape")->aimed);
  for (const int component : {0, 1, 2}) {
    EXPECT_NEAR(import.Value("camShape", kPointOfInterest, component), 0.0, kTolerance);
  }
}

TEST(LayerPeculiarities, TargetInItsShortFormDoesNotAim) {
  const SceneImport import(Aimed(std::string(kTurns) + "connectAttr \"target.t\" \"aim.tg[0].tt\";\n"));
  EXPECT_FALSE(import.Layer("camShape")->aimed);
}

TEST(LayerPeculiarities, ConstraintVectorAxisHasNoShortForm) {
  {
    const SceneImport shortForm(Aimed(std::string("connectAttr \"aim.cvx\" \"cam.rx\";\n") + kLooksAt));
    EXPECT_FALSE(shortForm.Layer("camShape")->aimed);
  }
  {
    const SceneImport longForm(
        Aimed(std::string("connectAttr \"aim.constraintVectorX\" \"cam.rx\";\n") + kLooksAt));
    EXPECT_TRUE(longForm.Layer("camShape")->aimed);
  }
}

TEST(LayerPeculiarities, FailureLeavesWhatWasMade) {
  const SceneImport import(Scene(Camera() + "createNode camera -n \"second\";"),
                           Failing("NewCameraLayer", 2));
  EXPECT_EQ(import.result().code, kRehearsedCode);
  EXPECT_EQ(import.LayersNamed("camShape"), 1u);
  EXPECT_EQ(import.LayersNamed("second"), 0u);
}

TEST(LayerPeculiarities, KeysBeforeAFailureStay) {
  // Key 6 is the second of the scale; key 7 would be the second of the X rotation.
  const SceneImport import(Scene(Camera() + Curve("k", "1 0 2 1 3 2") + Drive("k", "cam.tx")),
                           Failing("AddBatchKeyframe", 7));
  EXPECT_EQ(import.result().code, kRehearsedCode);
  EXPECT_EQ(import.KeyCount("camShape", kScale), 2u);
  EXPECT_EQ(import.KeyCount("camShape", kRotationX), 1u);
  EXPECT_EQ(import.KeyCount("camShape", kPosition), 1u);
}

TEST(LayerPeculiarities, FileObjectOfAnImportIsKept) {
  const SceneImport import(Scene(Camera()));
  ASSERT_THAT(import.result().leftovers, SizeIs(1));
  EXPECT_TRUE(import.result().leftovers[0].keptByDesign);
  EXPECT_THAT(import.result().leftovers[0].description, testing::HasSubstr("shot.ma"));
}

TEST(LayerPeculiarities, CameraValueThatCannotBeSetLeavesItsStreamUnreleased) {
  const SceneImport import(Scene(Camera()), Failing("SetStreamValue", 1));
  EXPECT_EQ(import.result().code, kRehearsedCode);
  ASSERT_THAT(import.result().leftovers, SizeIs(2));
  EXPECT_THAT(import.result().leftovers[0].description, testing::HasSubstr("position of layer:1"));
  EXPECT_TRUE(import.result().ledgerClean());
}

TEST(LayerPeculiarities, ZoomThatAlreadyHasKeysIsLeftAloneAndUnreleased) {
  refhost::HostOptions options;
  options.zoomKeys = 3;
  const SceneImport import(Scene(Camera() + Curve("lens", "1 35 2 70") + Drive("lens", "camShape.fl")),
                           options);
  EXPECT_EQ(import.result().code, 0);
  EXPECT_EQ(import.KeyCount("camShape", kZoom), 3u);
  ASSERT_THAT(import.result().leftovers, SizeIs(2));
  EXPECT_THAT(import.result().leftovers[0].description, testing::HasSubstr("zoom of layer:1"));
  EXPECT_TRUE(import.result().ledgerClean());
}

TEST(LayerPeculiaritiesDeathTest, ExceptionOutOfASuiteReleaseEndsTheProcess) {
  refhost::HostOptions options;
  refhost::Failure failure;
  failure.operation = "ReleaseSuiteByName";
  failure.kind = refhost::Failure::Kind::BadAlloc;
  options.failures.push_back(failure);
  EXPECT_EXIT(SceneImport(Scene(Camera()), options), testing::KilledBySignal(SIGABRT), "");
}

}  // namespace
}  // namespace docs_test

// The head of a report: lenses that are driven, locators and look-ats.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "tests/check/CheckedText.h"

namespace check_test {
namespace {

using check::CameraHead;
using check::Head;

const std::string kPlayed =
    "createNode script -n \"sceneConfigurationScriptNode\";\n"
    "\tsetAttr \".b\" -type \"string\" \"playbackOptions -min 3 -max 12 -ast 3 -aet 12 \";\n";

CameraHead CameraOf(const std::string& text) {
  const Checked checked(text);
  EXPECT_EQ(checked.report().head.cameras.size(), 1u);
  return checked.report().head.cameras.empty() ? CameraHead{} : checked.report().head.cameras.front();
}

void ExpectSpan(const std::optional<check::Span>& span, double least, double largest) {
  ASSERT_TRUE(span.has_value());
  EXPECT_NEAR(span->least, least, 1e-9);
  EXPECT_NEAR(span->largest, largest, 1e-9);
}

TEST(HeadTest, TheCompositionIsThatOfTheImport) {
  const Checked checked(CameraScene("", "", kPlayed + CurveOf("moveX", "3 0 7 5", "shotCam.tx")));
  const auto& made = checked.report().head.composition;
  ASSERT_TRUE(made.has_value());
  EXPECT_EQ(made->framesPerSecond, 24.0);
  EXPECT_EQ(made->seconds, checked.cameOver().composition->seconds);
  EXPECT_LT(made->seconds * 24.0, 10.0);  // played are 10 frames
  EXPECT_FALSE(Checked("#usda 1.0").report().head.composition.has_value());
}

TEST(HeadTest, ALongNameIsCut) {
  const std::string name(5000, 'n');
  const CameraHead camera = CameraOf(CameraScene(
      "", "",
      "createNode transform -n \"" + name + "\";\nparent -s -nc -r -add \"shotCam\" \"" + name + "\";\n"));
  std::size_t longest = camera.path.size();
  for (const check::ChainLink& link : camera.chain) longest = std::max(longest, link.name.size());
  EXPECT_LE(longest, 1003u);
}

TEST(HeadTest, ADrivenLensTakesValuesOverTheFrames) {
  const CameraHead camera =
      CameraOf(CameraScene("", "\tsetAttr \".fl\" 18;\n",
                           CurveOf("zoom", "5 40 9 80", "shotCamShape.fl", "animCurveTU") + kPlayed));
  EXPECT_EQ(camera.focalLength.value, 18.0);
  ASSERT_TRUE(camera.overFrames.has_value());
  EXPECT_EQ(camera.overFrames->first, 3.0);
  EXPECT_EQ(camera.overFrames->last, 12.0);
  ExpectSpan(camera.overFrames->focalLength, 40.0, 80.0);
  EXPECT_FALSE(camera.overFrames->horizontalAperture.has_value());
  // Half the film's width, 1.41732 in, by the focal length: 2 atan(0.45) and 2 atan(0.225), in degrees.
  ASSERT_TRUE(camera.overFrames->angleOfView.has_value());
  EXPECT_NEAR(camera.overFrames->angleOfView->least, 25.361, 1e-3);
  EXPECT_NEAR(camera.overFrames->angleOfView->largest, 48.455, 1e-3);
}

TEST(HeadTest, ALensTakesTheValueOfAnotherNodesAttribute) {
  const CameraHead camera = CameraOf(CameraScene(
      "\taddAttr -ln \"lens\" -at \"double\";\n\tsetAttr \".lens\" 62;\n", "",
      CurveOf("moveX", "30 1 34 2", "shotCam.tx") + "connectAttr \"shotCam.lens\" \"shotCamShape.fl\";\n"));
  ASSERT_TRUE(camera.overFrames.has_value());
  ExpectSpan(camera.overFrames->focalLength, 62.0, 62.0);
  // The frames are those of the camera's place, too.
  EXPECT_EQ(camera.overFrames->first, 30.0);
  EXPECT_EQ(camera.overFrames->last, 34.0);
}

TEST(HeadTest, ValuesThatCannotBeComputedAreNotSaid) {
  const CameraHead camera =
      CameraOf(CameraScene("", "",
                           "createNode expression -n \"breathe\";\n" +
                               CurveOf("film", "1 1 4 2", "shotCamShape.hfa", "animCurveTU") +
                               "connectAttr \"breathe.out[0]\" \"shotCamShape.fl\";\n"));
  ASSERT_EQ(camera.drives.size(), 2u);
  EXPECT_EQ(camera.drives[0].type, "expression");
  ASSERT_TRUE(camera.overFrames.has_value());
  EXPECT_FALSE(camera.overFrames->focalLength.has_value());
  EXPECT_FALSE(camera.overFrames->angleOfView.has_value());
  ExpectSpan(camera.overFrames->horizontalAperture, 1.0, 2.0);
}

TEST(HeadTest, AStillLensHasNoFrames) { EXPECT_FALSE(CameraOf(CameraScene("")).overFrames.has_value()); }

TEST(HeadTest, AnOrthographicCameraHasItsWidth) {
  EXPECT_FALSE(CameraOf(CameraScene("")).orthographicWidth.has_value());
  const CameraHead camera =
      CameraOf(CameraScene("", "\tsetAttr \".o\" yes;\n\tsetAttr \".ow\" 30;\n",
                           CurveOf("widen", "1 20 4 50", "shotCamShape.ow", "animCurveTU")));
  ASSERT_TRUE(camera.orthographicWidth.has_value());
  EXPECT_EQ(camera.orthographicWidth->value, 30.0);
  EXPECT_TRUE(camera.orthographicWidth->where.has_value());
  ASSERT_TRUE(camera.overFrames.has_value());
  ExpectSpan(camera.overFrames->orthographicWidth, 20.0, 50.0);
}

// Two marked locators beside one that is not; what stands above the second one is a layer, too.
TEST(HeadTest, MarkedLocatorsAreShownWithTheirLayers) {
  const Checked checked(
      CameraScene("", "",
                  "createNode transform -n \"aNull\";\ncreateNode locator -n \"aNullShape\" -p \"aNull\";\n"
                  "createNode transform -n \"other\";\ncreateNode locator -n \"otherShape\" -p \"other\";\n"
                  "createNode transform -n \"stage\";\ncreateNode transform -n \"mark\" -p \"stage\";\n"
                  "createNode locator -n \"null_markShape\" -p \"mark\";\n" +
                      CurveOf("moveX", "1 1 2 5 4 7", "mark.tx")));
  const Head& head = checked.report().head;
  ASSERT_EQ(head.locators.size(), 2u);
  EXPECT_EQ(head.locators[0].path, "|aNull|aNullShape");
  EXPECT_TRUE(head.locators[0].cameOver);
  EXPECT_EQ(head.locators[0].keys, 0u);
  EXPECT_EQ(head.locators[0].parents, 0u);
  EXPECT_EQ(head.locators[1].path, "|stage|mark|null_markShape");
  EXPECT_EQ(head.locators[1].where.place.line, 18u);
  EXPECT_TRUE(head.locators[1].cameOver);
  EXPECT_EQ(head.locators[1].keys, 3u);
  EXPECT_EQ(head.locators[1].parents, 1u);
  ASSERT_EQ(head.locators[1].chain.size(), 2u);
  EXPECT_EQ(head.locators[1].chain[0].drives.at(0).channel, "translateX");
  EXPECT_EQ(head.locators[1].chain[1].name, "stage");
}

// The import stops before any layer is made.
TEST(HeadTest, ALocatorOfARefusedSceneDidNotComeOver) {
  const Checked checked(
      CameraScene("", "", "createNode locator -n \"nullShape\" -p \"shotCam\";\nselect |a;\n"));
  ASSERT_EQ(checked.report().head.locators.size(), 1u);
  EXPECT_FALSE(checked.report().head.locators[0].cameOver);
}

std::string LookAtScene(std::string_view target, std::string_view weight = "") {
  return CameraScene(
      "", "",
      "createNode transform -n \"prop\";\ncreateNode aimConstraint -n \"propAim\" -p \"prop\";\n"
      "createNode transform -n \"goal\";\ncreateNode lookAt -n \"look\";\n"
      "connectAttr \"propAim.constraintRotateX\" \"prop.rx\";\n"
      "connectAttr \"look.constraintRotateX\" \"shotCam.rx\";\n"
      "connectAttr \"shotCam.translate\" \"look.constraintTranslate\";\n"
      "connectAttr \"goal.translate\" \"look." +
          std::string(target) + "\";\n" + std::string(weight));
}

TEST(HeadTest, ALookAtIsShownWithWhatItAims) {
  const Checked checked(LookAtScene("target[0].targetTranslate"));
  const Head& head = checked.report().head;
  ASSERT_EQ(head.lookAts.size(), 2u);
  // That of a camera comes first.
  EXPECT_EQ(head.lookAts[0].name, "look");
  EXPECT_EQ(head.lookAts[0].turns, "shotCam");
  EXPECT_EQ(head.lookAts[0].camera, "shotCamShape");
  EXPECT_EQ(head.lookAts[0].target, "goal");
  EXPECT_EQ(head.lookAts[1].name, "propAim");
  EXPECT_EQ(head.lookAts[1].turns, "prop");
  EXPECT_EQ(head.lookAts[1].camera, "");
}

TEST(HeadTest, ALookAtThatIsNotRecognisedAimsNoCamera) {
  const Checked checked(LookAtScene("tg[0].tt"));
  ASSERT_EQ(checked.report().head.lookAts.size(), 2u);
  EXPECT_EQ(checked.report().head.lookAts[0].turns, "shotCam");
  EXPECT_EQ(checked.report().head.lookAts[0].camera, "");
  EXPECT_EQ(checked.report().head.lookAts[0].target, "");
}

// A connection of the look-at to its own weight takes the place of the target; one of a curve does not.
TEST(HeadTest, TheLastTargetThatTheImportTakesIsShown) {
  const Checked own(
      LookAtScene("target[0].targetTranslate", "connectAttr \"look.w0\" \"look.target[0].targetWeight\";\n"));
  EXPECT_EQ(own.report().head.lookAts.at(0).target, "look");
  const Checked curve(
      LookAtScene("target[0].targetTranslate",
                  CurveOf("weight", "1 0 2 1", "look.target[0].targetWeight", "animCurveTU")));
  EXPECT_EQ(curve.report().head.lookAts.at(0).target, "goal");
}

TEST(HeadTest, MoreThanAHundredOfAKindAreCountedUnlessAllAreAskedFor) {
  std::string text = kHead;
  for (int i = 0; i < 103; ++i) {
    const std::string n = std::to_string(i);
    text += "createNode camera -n \"c" + n + "\";\ncreateNode locator -n \"null" + n + "\";\n";
    if (i != 0) text += "createNode lookAt -n \"l" + n + "\";\n";
  }
  const Checked cut(text);
  const Head& head = cut.report().head;
  EXPECT_EQ(head.cameras.size(), 100u);
  EXPECT_EQ(head.camerasNotShown, 3u);
  EXPECT_EQ(head.locators.size(), 100u);
  EXPECT_EQ(head.locatorsNotShown, 3u);
  EXPECT_EQ(head.lookAts.size(), 100u);
  EXPECT_EQ(head.lookAtsNotShown, 2u);
  check::Options options;
  options.all = true;
  const Checked all(text, options);
  EXPECT_EQ(all.report().head.cameras.size(), 103u);
  EXPECT_EQ(all.report().head.locators.size(), 103u);
  EXPECT_TRUE(all.report().head.locators.back().cameOver);
  EXPECT_EQ(all.report().head.lookAts.size(), 102u);
  EXPECT_EQ(all.report().head.camerasNotShown, 0u);
}

}  // namespace
}  // namespace check_test

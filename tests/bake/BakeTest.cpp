// The transforms of a bake.
#include "bake/Bake.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include "tests/bake/BakeFixture.h"

namespace {

using bake_test::Baked;
using bake_test::CameraScene;
using bake_test::CurveOf;
using testing::DoubleNear;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;

constexpr double kRounding = 1e-9;

std::string WithoutComments(const std::string& text) {
  std::string kept;
  std::size_t at = 0;
  while (at < text.size()) {
    const std::size_t end = text.find('\n', at);
    const std::string line = text.substr(at, end - at + 1);
    if (line.substr(0, 2) != "//") kept += line;
    at = end + 1;
  }
  return kept;
}

TEST(Bake, AStillCameraIsWrittenOnceWithoutACurve) {
  const Baked baked(
      CameraScene("\tsetAttr \".t\" -type \"double3\" 1.1 2.2 3.3 ;\n\tsetAttr \".rx\" 4.4;\n"));
  EXPECT_EQ(baked.Number("shotCam", "translateX"), 1.1);
  EXPECT_EQ(baked.Number("shotCam", "translateY"), 2.2);
  EXPECT_EQ(baked.Number("shotCam", "translateZ"), 3.3);
  EXPECT_EQ(baked.Number("shotCam", "rotateX"), 4.4);
  EXPECT_EQ(baked.ParentOf("shotCamShape"), "shotCam");
  EXPECT_THAT(baked.text(), testing::Not(HasSubstr("animCurve")));
  EXPECT_FALSE(baked.report().cameras.at(0).moves);
}

TEST(Bake, ThePlainChannelsOfAMovingCameraKeepTheirBits) {
  const std::string curve = CurveOf("animCurveTA", "c", "1 0.1 3 0.7", "shotCam.ry");
  const Baked baked(CameraScene("\tsetAttr \".tx\" 0.30000000000000004;\n", "", curve));
  EXPECT_THAT(baked.Times("shotCam", "rotateY"), ElementsAre(0, 1, 2));
  const std::vector<double> keys = baked.Keys("shotCam", "rotateY");
  ASSERT_THAT(keys, SizeIs(3));
  EXPECT_EQ(keys[0], 0.1);
  EXPECT_THAT(keys[1], DoubleNear(0.4, kRounding));
  EXPECT_EQ(keys[2], 0.7);
  EXPECT_EQ(baked.Number("shotCam", "translateX"), 0.30000000000000004);
  EXPECT_THAT(baked.Keys("shotCam", "translateX"), IsEmpty());
}

TEST(Bake, KeysBeginAtFrame0WhateverTheRangeAndFollowTheStep) {
  bake::Options options;
  options.frames = bake::FrameSpan{1001, 1002};
  options.step = 0.5;
  const std::string curve = CurveOf("animCurveTL", "c", "1001 0 1002 1", "shotCam.tx");
  const Baked baked(CameraScene("", "", curve), options);
  EXPECT_THAT(baked.Times("shotCam", "translateX"), ElementsAre(0, 0.5, 1));
  EXPECT_THAT(baked.text(), HasSubstr("playbackOptions -min 0 -max 1 "));
  EXPECT_THAT(baked.text(), HasSubstr("Frame 0 is frame 1001 of that scene"));
}

TEST(Bake, ARangeOfOneFrameHasNoCurve) {
  bake::Options options;
  options.frames = bake::FrameSpan{2, 2};
  const Baked baked(CameraScene("", "", CurveOf("animCurveTL", "c", "1 0 3 1", "shotCam.tx")), options);
  EXPECT_THAT(baked.Number("shotCam", "translateX"), DoubleNear(0.5, kRounding));
  EXPECT_THAT(baked.text(), testing::Not(HasSubstr("animCurve")));
}

TEST(Bake, AnotherRotateOrderComesInXyzOrder) {
  // About y, then z, then x: x goes to y, y to z, z to x, which is x and then z in XYZ order.
  const Baked baked(CameraScene("\tsetAttr \".ro\" 1;\n\tsetAttr \".r\" -type \"double3\" 90 90 0 ;\n"));
  EXPECT_EQ(baked.Number("shotCam", "rotateOrder"), 0);
  EXPECT_THAT(baked.Number("shotCam", "rotateX"), DoubleNear(90, kRounding));
  EXPECT_THAT(baked.Number("shotCam", "rotateY"), DoubleNear(0, kRounding));
  EXPECT_THAT(baked.Number("shotCam", "rotateZ"), DoubleNear(90, kRounding));
}

TEST(Bake, PivotsAreInTheTranslation) {
  // Half a turn about a pivot at x 1: the origin goes to x 2.
  const Baked baked(CameraScene("\tsetAttr \".rp\" -type \"double3\" 1 0 0 ;\n\tsetAttr \".ry\" 180;\n"));
  EXPECT_THAT(baked.Number("shotCam", "translateX"), DoubleNear(2, kRounding));
  EXPECT_EQ(baked.Number("shotCam", "rotatePivotX"), 0);
}

TEST(Bake, ParentsStayWhereTheyAreAndAreWrittenOnce) {
  const Baked baked(
      "createNode transform -n \"rig\";\n\tsetAttr \".tx\" 5;\n"
      "createNode transform -n \"left\" -p \"rig\";\ncreateNode camera -n \"leftShape\" -p \"left\";\n"
      "createNode transform -n \"right\" -p \"rig\";\ncreateNode camera -n \"rightShape\" -p \"right\";\n");
  EXPECT_EQ(baked.ParentOf("left"), "rig");
  EXPECT_EQ(baked.ParentOf("right"), "rig");
  EXPECT_FALSE(baked.Has("rig_2"));
  EXPECT_EQ(baked.report().cameras.at(1).method, bake::Method::kHierarchy);
}

TEST(Bake, ACameraUnderAScaleComesInWorldSpace) {
  const Baked baked(
      "createNode transform -n \"rig\";\n\tsetAttr \".s\" -type \"double3\" 2 2 2 ;\n\tsetAttr \".ty\" 7;\n"
      "createNode transform -n \"shotCam\" -p \"rig\";\n\tsetAttr \".tx\" 3;\n"
      "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n");
  EXPECT_FALSE(baked.Has("rig"));
  EXPECT_EQ(baked.ParentOf("shotCam"), "");
  EXPECT_THAT(baked.Number("shotCam", "translateX"), DoubleNear(6, kRounding));
  EXPECT_THAT(baked.Number("shotCam", "translateY"), DoubleNear(7, kRounding));
  EXPECT_EQ(baked.Number("shotCam", "scaleX"), 1);
  EXPECT_EQ(baked.report().cameras.at(0).method, bake::Method::kWorld);
  EXPECT_EQ(baked.CountOf(diag::Code::CameraInWorldSpace), 1u);
}

TEST(Bake, AShearedCameraLooksWhereItsThirdAxisPoints) {
  const Baked baked(CameraScene("\tsetAttr \".sh\" -type \"double3\" 0 1 0 ;\n"));
  EXPECT_THAT(baked.Number("shotCam", "rotateX"), DoubleNear(0.0, kRounding));
  EXPECT_THAT(baked.Number("shotCam", "rotateY"), DoubleNear(45.0, kRounding));
  EXPECT_THAT(baked.Number("shotCam", "rotateZ"), DoubleNear(0.0, kRounding));
  EXPECT_EQ(baked.CountOf(diag::Code::CameraSheared), 1u);
  EXPECT_EQ(baked.CountOf(diag::Code::CameraUneven), 0u);
}

TEST(Bake, ACameraThatIsScaledUnevenlyIsReported) {
  const Baked baked(CameraScene("\tsetAttr \".s\" -type \"double3\" 2 2 3 ;\n"));
  EXPECT_EQ(baked.CountOf(diag::Code::CameraUneven), 1u);
  EXPECT_EQ(baked.CountOf(diag::Code::CameraSheared), 0u);
  const Baked even(CameraScene("\tsetAttr \".s\" -type \"double3\" 2 2 2 ;\n"));
  EXPECT_EQ(even.CountOf(diag::Code::CameraUneven), 0u);
}

TEST(Bake, ANullUnderAScaleStaysInTheHierarchy) {
  const Baked baked(
      "createNode transform -n \"rig\";\n\tsetAttr \".s\" -type \"double3\" 2 2 2 ;\n"
      "createNode transform -n \"point\" -p \"rig\";\ncreateNode locator -n \"nullShape\" -p \"point\";\n");
  EXPECT_EQ(baked.ParentOf("point"), "rig");
  EXPECT_EQ(baked.Number("rig", "scaleY"), 2);
}

TEST(Bake, ACameraWhoseParentIsElsewhereComesWithoutIt) {
  const Baked baked(
      "createNode transform -n \"shotCam\" -p \"hero:head\";\n\tsetAttr \".tx\" 3;\n"
      "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n");
  EXPECT_EQ(baked.ParentOf("shotCam"), "");
  EXPECT_EQ(baked.report().cameras.at(0).method, bake::Method::kWorld);
  EXPECT_EQ(baked.Number("shotCam", "translateX"), 3);
}

TEST(Bake, ATransformThatInheritsNothingHasNoParent) {
  const Baked baked(
      "createNode transform -n \"rig\";\n\tsetAttr \".tx\" 5;\n"
      "createNode transform -n \"shotCam\" -p \"rig\";\n\tsetAttr \".it\" no;\n\tsetAttr \".ty\" 2;\n"
      "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n");
  EXPECT_FALSE(baked.Has("rig"));
  EXPECT_EQ(baked.Number("shotCam", "translateX"), 0);
  EXPECT_EQ(baked.Number("shotCam", "translateY"), 2);
}

TEST(Bake, InTheWorldEveryCameraIsByItself) {
  bake::Options options;
  options.world = true;
  const Baked baked(
      "createNode transform -n \"rig\";\n\tsetAttr \".tx\" 5;\n"
      "createNode transform -n \"shotCam\" -p \"rig\";\n\tsetAttr \".tx\" 1;\n"
      "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n",
      options);
  EXPECT_FALSE(baked.Has("rig"));
  EXPECT_THAT(baked.Number("shotCam", "translateX"), DoubleNear(6, kRounding));
  EXPECT_EQ(baked.CountOf(diag::Code::CameraInWorldSpace), 0u);
}

TEST(Bake, AnglesRunOnBeyondHalfATurn) {
  // The rotate order makes the angles come out of the matrix.
  const std::string curve = CurveOf("animCurveTA", "c", "1 0 9 480", "shotCam.ry");
  const Baked baked(CameraScene("\tsetAttr \".ro\" 4;\n", "", curve));
  const std::vector<double> keys = baked.Keys("shotCam", "rotateY");
  ASSERT_THAT(keys, SizeIs(9));
  // A turn about y can be said in two ways beyond a quarter: both end where the camera looks.
  EXPECT_THAT(keys[1], DoubleNear(60, kRounding));
  EXPECT_THAT(keys[8], DoubleNear(480, kRounding));
}

TEST(Bake, LocatorsGetTheirMark) {
  bake::Options options;
  options.locators = bake::Locators::kAll;
  const Baked baked(
      "createNode transform -n \"point\";\n\tsetAttr \".tx\" 9;\n"
      "createNode locator -n \"pointShape\" -p \"point\";\ncreateNode locator -n \"aNull\" -p \"point\";\n",
      options);
  EXPECT_EQ(baked.ParentOf("null_pointShape"), "point");
  EXPECT_EQ(baked.ParentOf("aNull"), "point");
  EXPECT_EQ(baked.Number("point", "translateX"), 9);
  EXPECT_EQ(baked.report().locators, 2u);
}

TEST(Bake, AMarkBeyondWhatIsKeptOfANameIsSetAgain) {
  const std::string name = std::string(230, 'x') + "null";
  const Baked baked("createNode transform -n \"point\";\ncreateNode locator -n \"" + name +
                    "\" -p \"point\";\n");
  EXPECT_TRUE(baked.Has("null_" + std::string(195, 'x')));
}

TEST(Bake, NodesOfOneNameGetNumbersAndTheirPathsStandInComments) {
  const Baked baked(
      "createNode transform -n \"a\";\ncreateNode transform -n \"b\";\n"
      "createNode transform -n \"cam\" -p \"a\";\ncreateNode camera -n \"camShape\" -p \"|a|cam\";\n"
      "createNode transform -n \"cam\" -p \"b\";\ncreateNode camera -n \"camShape\" -p \"|b|cam\";\n");
  EXPECT_EQ(baked.ParentOf("cam_2"), "b");
  EXPECT_EQ(baked.ParentOf("camShape_2"), "cam_2");
  EXPECT_THAT(baked.text(), HasSubstr("// |b|cam|camShape\n"));
}

TEST(Bake, TheReportOfACameraNamesTheChannelsThatKeepTheirStoredValues) {
  const Baked baked(
      "createNode expression -n \"shake\";\ncreateNode transform -n \"rig\";\n"
      "connectAttr \"shake.out[0]\" \"rig.tx\";\n"
      "createNode transform -n \"left\" -p \"rig\";\ncreateNode camera -n \"leftShape\" -p \"left\";\n"
      "connectAttr \"shake.out[1]\" \"leftShape.fl\";\n"
      "createNode transform -n \"free\";\ncreateNode camera -n \"freeShape\" -p \"free\";\n"
      "createNode transform -n \"large\" -p \"rig\";\n\tsetAttr \".s\" -type \"double3\" 2 2 2 ;\n"
      "createNode camera -n \"largeShape\" -p \"large\";\n");
  const auto differences = [&baked](std::size_t camera) {
    return baked.report().cameras.at(camera).differences;
  };
  EXPECT_THAT(
      differences(0),
      ElementsAre("\"|rig|left|leftShape.focalLength\" is driven by \"|shake.out[1]\" (expression), which "
                  "cannot be computed here",
                  "\"|rig.translateX\" is driven by \"|shake.out[0]\" (expression), which cannot be "
                  "computed here"));
  EXPECT_THAT(differences(1), testing::IsEmpty());
  EXPECT_THAT(differences(2),
              ElementsAre(testing::HasSubstr("|rig.translateX"), testing::HasSubstr("comes without")));
  EXPECT_EQ(baked.CountOf(diag::Code::UnsupportedDriver), 2u);
}

TEST(Bake, ABakeOfABakeDiffersInCommentsAlone) {
  const std::string curve = CurveOf("animCurveTL", "shotCam_translateX", "11 0.1 14 0.9", "shotCam.tx");
  const std::string turn = CurveOf("animCurveTA", "turn", "10 0 15 300", "shotCam.rz");
  const Baked first(
      CameraScene("\tsetAttr \".ro\" 3;\n\tsetAttr \".rx\" 33;\n", "\tsetAttr \".ff\" 0;\n", curve + turn));
  const Baked second(first.text());
  EXPECT_EQ(WithoutComments(second.text()), WithoutComments(first.text()));
  EXPECT_THAT(first.Keys("shotCam", "rotateZ"), SizeIs(6));
}

TEST(Bake, TheSameSceneGivesTheSameBytes) {
  const std::string text = CameraScene("", "", CurveOf("animCurveTL", "c", "1 0 9 1", "shotCam.tx"));
  EXPECT_EQ(Baked(text).text(), Baked(text).text());
}

TEST(Bake, ASceneWithoutACameraIsAValidBakeAndAWarning) {
  const Baked baked("createNode transform -n \"a\";\n");
  EXPECT_EQ(baked.CountOf(diag::Code::NoCamera), 1u);
  EXPECT_THAT(baked.text(), HasSubstr("currentUnit -l centimeter -a degree -t film;"));
}

TEST(Bake, ManyCamerasUnderADeepRigTakeNoMoreThanBoth) {
  std::string text = "createNode transform -n \"n0\";\n";
  constexpr int kDeep = 3'000;
  for (int i = 1; i < kDeep; ++i) {
    text += "createNode transform -n \"n" + std::to_string(i) + "\" -p \"n" + std::to_string(i - 1) + "\";\n";
  }
  for (int i = 0; i < 1'000; ++i) {
    text +=
        "createNode camera -n \"c" + std::to_string(i) + "\" -p \"n" + std::to_string(kDeep - 1) + "\";\n";
  }
  const Baked baked(text);
  EXPECT_THAT(baked.report().cameras, SizeIs(1'000));
  EXPECT_LT(baked.text().size(), 1'300u * (kDeep + 1'000));  // paths are cut
}

}  // namespace

// "createNode": names, parents, defaults, and which record becomes current.
#include <cstring>

#include "hostapi/ErrorCodes.h"
#include "hostutil/HostSetup.h"
#include "tests/support/ReaderFixture.h"

namespace testsupport {
namespace {

using namespace std::string_view_literals;
using ::testing::Each;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

class NodesTest : public ReaderTest {
 protected:
  // The name and the parent that the options give a transform.
  std::pair<std::string, std::string> Names(std::string_view options) {
    const std::string text = "createNode transform " + std::string(options);
    EXPECT_EQ(Read(text), 0) << text;
    EXPECT_EQ(TransformCount(), 1) << text;
    const MAYA_Transform transform = TransformAt(0);
    EXPECT_EQ(scene().currentKind, kTransformNode);
    EXPECT_EQ(std::memcmp(&scene().current.transform, &transform, sizeof(transform)), 0);
    return {transform.name, transform.parent};
  }
  using Pair = std::pair<std::string, std::string>;
};

TEST_F(NodesTest, ATransformHasItsDefaults) {
  ASSERT_EQ(Read("createNode transform -s -n \"persp\";\n"), 0);
  const MAYA_Transform transform = TransformAt(0);
  EXPECT_STREQ(transform.name, "persp");
  EXPECT_STREQ(transform.parent, "");
  EXPECT_THAT(Values(transform.translate), Each(0.0));
  EXPECT_THAT(Values(transform.rotate), Each(0.0));
  EXPECT_THAT(Values(transform.scale), Each(1.0));
  EXPECT_THAT(Values(transform.rotatePivot), Each(0.0));
  EXPECT_THAT(Values(transform.scalePivot), Each(0.0));
  EXPECT_THAT(Values(transform.curve), Each(-1));
  EXPECT_EQ(scene().currentKind, kTransformNode);
  EXPECT_STREQ(scene().current.transform.name, "persp");
}

TEST_F(NodesTest, AConstraintIsATransformLikeAnyOther) {
  ASSERT_EQ(Read("createNode transform -n \"a\" -p \"b\";\n"), 0);
  const MAYA_Transform transform = TransformAt(0);
  for (const char* const type : {"lookAt", "aimConstraint", "stereoRigTransform"}) {
    ASSERT_EQ(Read("createNode " + std::string(type) + " -n \"a\" -p \"b\";\n"), 0);
    const MAYA_Transform constraint = TransformAt(0);
    EXPECT_EQ(std::memcmp(&constraint, &transform, sizeof(transform)), 0) << type;
  }
}

TEST_F(NodesTest, ACameraHasItsDefaultsAndItsParent) {
  ASSERT_EQ(Read("createNode camera -n \"cameraShape1\" -p \"camera1\";\n"), 0);
  const MAYA_Camera camera = CameraAt(0);
  EXPECT_STREQ(camera.name, "cameraShape1");
  EXPECT_STREQ(camera.parent, "camera1");
  EXPECT_THAT(Values(camera.cameraAperture), ElementsAre(1.4173, 0.9449));
  EXPECT_THAT(Values(camera.worldCenterOfInterest), Each(0.0));
  EXPECT_DOUBLE_EQ(camera.focalLength, 35.0);
  EXPECT_EQ(camera.filmFit, 0);
  EXPECT_EQ(camera.orthographic, 0);
  EXPECT_EQ(camera.focalLengthCurve, -1);
  EXPECT_EQ(scene().currentKind, kCameraNode);
}

TEST_F(NodesTest, ALocatorBecomesCurrentAndTakesNoAttributes) {
  ASSERT_EQ(Read("createNode locator -n \"locatorShape1\" -p \"locator1\";\nsetAttr \".t\" 1 2 3;\n"), 0);
  EXPECT_STREQ(LocatorAt(0).name, "locatorShape1");
  EXPECT_STREQ(LocatorAt(0).parent, "locator1");
  EXPECT_EQ(scene().currentKind, kLocatorNode);
  EXPECT_EQ(scene().transforms, nullptr);
}

TEST_F(NodesTest, ACurveBeginsWithoutKeys) {
  ASSERT_EQ(Read("createNode animCurveTU -n \"cam_fl\" -p \"nobody\";\n"), 0);
  EXPECT_STREQ(CurveAt(0).name, "cam_fl");
  EXPECT_STREQ(CurveAt(0).parent, "nobody");
  EXPECT_EQ(CurveAt(0).keys, nullptr);
  EXPECT_EQ(scene().currentKind, kCurveNode);
}

TEST_F(NodesTest, RecordsKeepTheOrderOfTheirCreationWithinTheirKind) {
  ASSERT_EQ(Read("createNode transform -n \"t0\";\ncreateNode camera -n \"c0\";\ncreateNode aimConstraint -n "
                 "\"t1\";\n"
                 "createNode stereoRigCamera -n \"c1\";\ncreateNode transform -n \"t2\";\n"),
            0);
  EXPECT_STREQ(TransformAt(0).name, "t0");
  EXPECT_STREQ(TransformAt(1).name, "t1");
  EXPECT_STREQ(TransformAt(2).name, "t2");
  EXPECT_STREQ(CameraAt(0).name, "c0");
  EXPECT_STREQ(CameraAt(1).name, "c1");
}

TEST_F(NodesTest, TheOptionsAreKnownInBothFormsAndAnyCase) {
  for (const char* const name : {"-n", "-name"})
    for (const char* const parent : {"-p", "-parent"})
      for (const std::string& n : CaseChanges(name))
        for (const std::string& p : CaseChanges(parent))
          EXPECT_EQ(Names(n + " \"a\" " + p + " \"b\";\n"), Pair("a", "b")) << n << p;
}

TEST_F(NodesTest, NamesKeepTheirOwnCase) {
  EXPECT_EQ(Names("-n \"MyCam\" -p \"|Grp|RIG\";"), Pair("MyCam", "|Grp|RIG"));
}

TEST_F(NodesTest, OtherOptionsAreIgnoredAndTheirValuesPassedOver) {
  EXPECT_EQ(Names("-s -ss -x \"value\" 12 ( ) : + - /*c*/ -n \"a\" \"stray\" -nn \"c\" -na \"d\";"),
            Pair("a", ""));
}

TEST_F(NodesTest, ANameWithoutQuotesIsNotTaken) {
  EXPECT_EQ(Names("-n camera1;"), Pair("", ""));
  EXPECT_EQ(Names("-n 12 -p file;"), Pair("", ""));
}

TEST_F(NodesTest, WhatFollowsANameOptionIsLostWhenItIsNoString) {
  EXPECT_EQ(Names("-n -p \"x\" ;"), Pair("", ""));
  EXPECT_EQ(Names("-n /*c*/ \"x\" -p \"y\";"), Pair("", "y"));
  EXPECT_EQ(Names("-p : \"x\" -n \"y\";"), Pair("y", ""));
}

TEST_F(NodesTest, ASemicolonInPlaceOfANameEndsTheCommand) {
  EXPECT_EQ(Names("-p \"b\" -n; -n \"late\";"), Pair("", "b"));
  EXPECT_EQ(Names("-n \"a\" -p; -p \"late\";"), Pair("a", ""));
}

TEST_F(NodesTest, ALaterOptionReplacesAnEarlierOne) {
  EXPECT_EQ(Names("-n \"a\" -p \"b\" -name \"c\" -parent \"d\";"), Pair("c", "d"));
  EXPECT_EQ(Names("-n \"a\" -n b;"), Pair("a", ""));
  EXPECT_EQ(Names("-n \"a\" -n \"\";"), Pair("", ""));
}

TEST_F(NodesTest, ANameOf255BytesWithItsQuotesIsEmpty) {
  const std::string longest(252, 'n');
  EXPECT_EQ(Names("-n \"" + longest + "\" -p \"" + longest + "\";"), Pair(longest, longest));
  EXPECT_EQ(Names("-n \"" + longest + "x\" -p \"p\";"), Pair("", "p"));
  EXPECT_EQ(Names("-n \"n\" -p \"" + longest + "x\";"), Pair("n", ""));
  EXPECT_EQ(Names("-n \"n\" -n \"" + std::string(70000, 'x') + "\";"), Pair("", ""));
}

TEST_F(NodesTest, AnOptionOf255BytesMatchesNothing) {
  EXPECT_EQ(Names("-n" + std::string(253, 'n') + " \"a\";"), Pair("", ""));
}

TEST_F(NodesTest, AnOptionEndsAtItsFirstNul) { EXPECT_EQ(Names("-n\0x \"a\";"sv), Pair("a", "")); }

TEST_F(NodesTest, EqualNamesMakeRecordsOfTheirOwn) {
  ASSERT_EQ(Read("createNode transform -n \"rig\";\ncreateNode transform -n \"RIG\" -p \"rig\";\n"
                 "setAttr \".t\" -type \"double3\" 0 0 5 ;\n"),
            0);
  ASSERT_EQ(TransformCount(), 2);
  // The second node's values go to the first record of the name, the whole copy with them.
  EXPECT_STREQ(TransformAt(0).name, "RIG");
  EXPECT_STREQ(TransformAt(0).parent, "rig");
  EXPECT_THAT(Values(TransformAt(0).translate), ElementsAre(0, 0, 5));
  EXPECT_THAT(Values(TransformAt(1).translate), Each(0.0));
}

TEST_F(NodesTest, TheEndInsideACommandIsAnUnexpectedEndAndMakesNoRecord) {
  for (const char* const text :
       {"createNode transform ", "createNode camera -n ", "createNode locator -n \"a\"",
        "createNode animCurveTL -p \"a\" -s ", "createNode lookAt -n \"a\" -p \"b\"\n"}) {
    SCOPED_TRACE(text);
    EXPECT_EQ(Read(text), 1289986);
    EXPECT_THAT(Messages(), ElementsAre(kUnexpectedEndText));
    EXPECT_EQ(scene().currentKind, 0);
    EXPECT_THAT(HeldObjects(), IsEmpty());
  }
  EXPECT_EQ(Read("createNode camera -n \"c\" \0 ;\n"sv), 1289986);
  EXPECT_THAT(Messages(), ElementsAre(kUnexpectedEndText));
}

TEST_F(NodesTest, TheEndInsideASkippedCreateNodeIsNoError) {
  EXPECT_EQ(Read("createNode mesh -n \"a\""), 0);
  EXPECT_THAT(Messages(), IsEmpty());
}

TEST_F(NodesTest, AFailedListLeavesTheCurrentNode) {
  for (const char* const type : {"transform", "camera", "locator", "animCurveTU", "aimConstraint"}) {
    SCOPED_TRACE(type);
    const std::string text = "createNode mesh -n \"m\";\ncreateNode " + std::string(type) + " -n \"a\";\n";
    {
      const UtilityRehearsal failing(HOST_UTILITY_ListCreate, 1, 7001);
      EXPECT_EQ(Read(text), 7001);
    }
    EXPECT_EQ(scene().currentKind, 0);
    EXPECT_TRUE(CurrentIsZero());
    {
      const UtilityRehearsal failing(HOST_UTILITY_ListAppend, 1, 7002);
      EXPECT_EQ(Read(text), 7002);
    }
    EXPECT_EQ(scene().currentKind, 0);
    EXPECT_TRUE(CurrentIsZero());
    EXPECT_THAT(Messages(), IsEmpty());
  }
}

TEST_F(NodesTest, AFailedAppendKeepsTheNodeThatWasCurrent) {
  const UtilityRehearsal failing(HOST_UTILITY_ListAppend, 2, 7002);
  EXPECT_EQ(Read("createNode camera -n \"a\";\ncreateNode camera -n \"b\";\n"), 7002);
  EXPECT_EQ(scene().currentKind, kCameraNode);
  EXPECT_STREQ(scene().current.camera.name, "a");
  EXPECT_EQ(CameraCount(), 1);
}

}  // namespace
}  // namespace testsupport

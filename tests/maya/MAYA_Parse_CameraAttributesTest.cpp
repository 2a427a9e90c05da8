// "setAttr" on cameras.
#include "hostapi/ErrorCodes.h"
#include "hostutil/HostSetup.h"
#include "tests/support/ReaderFixture.h"

namespace testsupport {
namespace {

using ::testing::Each;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

class CameraAttributesTest : public ReaderTest {
 protected:
  HostError ReadWith(std::string_view commands) {
    return Read("createNode camera -n \"c\" -p \"p\";\n" + std::string(commands) + "\n");
  }

  MAYA_Camera CameraWith(std::string_view commands) {
    EXPECT_EQ(ReadWith(commands), 0) << commands;
    return CameraAt(0);
  }
};

TEST_F(CameraAttributesTest, EveryAttributeIsKnownInBothFormsAndAnyCase) {
  for (const char* const name : {".fl", ".focalLength"})
    for (const std::string& form : CaseChanges(name))
      EXPECT_DOUBLE_EQ(CameraWith("setAttr \"" + form + "\" 50.5;").focalLength, 50.5) << form;
  for (const char* const name : {".ff", ".filmFit"})
    for (const std::string& form : CaseChanges(name))
      EXPECT_EQ(CameraWith("setAttr \"" + form + "\" 2;").filmFit, 1) << form;
  for (const char* const name : {".o", ".orthographic"})
    for (const std::string& form : CaseChanges(name))
      EXPECT_EQ(CameraWith("setAttr \"" + form + "\" yes;").orthographic, 1) << form;
  for (const char* const name : {".wci", ".worldCenterOfInterest"})
    for (const std::string& form : CaseChanges(name))
      EXPECT_THAT(
          Values(CameraWith("setAttr \"" + form + "\" -type \"double3\" 1 -2 3;").worldCenterOfInterest),
          ElementsAre(1, -2, 3))
          << form;
  for (const char* const name : {".cap", ".cameraAperture"})
    for (const std::string& form : CaseChanges(name))
      EXPECT_THAT(
          Values(CameraWith("setAttr \"" + form + "\" -type \"double2\" 1.417 0.945;").cameraAperture),
          ElementsAre(1.417, 0.945))
          << form;
}

TEST_F(CameraAttributesTest, OtherNamesAreIgnored) {
  for (const char* const name :
       {".r", ".t", ".f", ".flx", "fl", "c.fl", ".fl[0]", "", ".ncp", ".coi", ".ow"}) {
    SCOPED_TRACE(name);
    const MAYA_Camera camera = CameraWith("setAttr \"" + std::string(name) + "\" 2 90 1;");
    EXPECT_DOUBLE_EQ(camera.focalLength, 35.0);
    EXPECT_EQ(camera.filmFit, 0);
    EXPECT_THAT(Values(camera.cameraAperture), ElementsAre(1.4173, 0.9449));
    EXPECT_THAT(Values(camera.worldCenterOfInterest), Each(0.0));
  }
}

TEST_F(CameraAttributesTest, ARotateIsNoCameraAttribute) {
  EXPECT_EQ(ReadWith("setAttr \".r\" -type \"double3\" 0 90 0;"), 0);
  EXPECT_EQ(scene().transforms, nullptr);
  EXPECT_EQ(scene().currentKind, kCameraNode);
}

TEST_F(CameraAttributesTest, OneOptionWithItsValueMayStandBeforeTheAttribute) {
  EXPECT_DOUBLE_EQ(CameraWith("setAttr -k off \".fl\" 36;").focalLength, 36.0);
  EXPECT_DOUBLE_EQ(CameraWith("setAttr -s 3 \".fl\" 36;").focalLength, 36.0);
  EXPECT_DOUBLE_EQ(CameraWith("setAttr -k \"x\" \".fl\" 36;").focalLength, 36.0);
  EXPECT_DOUBLE_EQ(CameraWith("setAttr -k off -l on \".fl\" 36;").focalLength, 35.0);
  EXPECT_DOUBLE_EQ(CameraWith("setAttr -k \".fl\" 36;").focalLength, 35.0);
  EXPECT_DOUBLE_EQ(CameraWith("setAttr -k /*c*/ off \".fl\" 36;").focalLength, 35.0);
  EXPECT_DOUBLE_EQ(CameraWith("setAttr off \".fl\" 36;").focalLength, 35.0);
}

TEST_F(CameraAttributesTest, AnOptionEatsTheNextTokenASemicolonIncluded) {
  EXPECT_DOUBLE_EQ(CameraWith("setAttr -k; \".fl\" 36;").focalLength, 36.0);
}

TEST_F(CameraAttributesTest, OrthographicCanBeSetButNeverCleared) {
  EXPECT_EQ(CameraWith("setAttr \".o\" yes;\nsetAttr \".o\" no;").orthographic, 1);
  EXPECT_EQ(CameraWith("setAttr \".o\" no;").orthographic, 0);
  EXPECT_EQ(CameraWith("setAttr \".o\" no Yes no;").orthographic, 1);
  EXPECT_EQ(CameraWith("setAttr \".o\" -type YES;").orthographic, 1);
  for (const char* const word : {"\"yes\"", "1", "on", "true", "yess", "-yes", ""})
    EXPECT_EQ(CameraWith("setAttr \".o\" " + std::string(word) + ";").orthographic, 0) << word;
}

TEST_F(CameraAttributesTest, OnlyAFilmFitOfTwoIsVertical) {
  struct Row {
    const char* numbers;
    std::int32_t fit;
  };
  for (const Row& row : {Row{"0", 0}, Row{"1", 0}, Row{"2", 1}, Row{"3", 0}, Row{"-2", 0}, Row{"2 1", 0},
                         Row{"1 2", 1}, Row{"2 3", 0}, Row{"2.5", 0}, Row{"2fit", 1}, Row{"1.9999", 0}}) {
    SCOPED_TRACE(row.numbers);
    EXPECT_EQ(CameraWith("setAttr \".ff\" " + std::string(row.numbers) + ";").filmFit, row.fit);
    // Also over an earlier value.
    EXPECT_EQ(CameraWith("setAttr \".ff\" 2;\nsetAttr \".ff\" " + std::string(row.numbers) + ";").filmFit,
              row.fit);
  }
  EXPECT_EQ(CameraWith("setAttr \".ff\" 2;\nsetAttr \".ff\";").filmFit, 1);
}

TEST_F(CameraAttributesTest, AFilmFitIsTwoWithinItsTolerance) {
  // Just below 2 the tolerance is 1e-12 times 2; just above it grows with the value.
  EXPECT_EQ(CameraWith("setAttr \".ff\" 1.9999999999981;").filmFit, 1);
  EXPECT_EQ(CameraWith("setAttr \".ff\" 1.9999999999979;").filmFit, 0);
  EXPECT_EQ(CameraWith("setAttr \".ff\" 2.0000000000019;").filmFit, 1);
  EXPECT_EQ(CameraWith("setAttr \".ff\" 2.0000000000021;").filmFit, 0);
}

TEST_F(CameraAttributesTest, TheLastFocalLengthWins) {
  EXPECT_DOUBLE_EQ(CameraWith("setAttr \".fl\" 50 85 -21;").focalLength, -21.0);
  EXPECT_DOUBLE_EQ(CameraWith("setAttr \".fl\" 50;\nsetAttr \".fl\" \"x\";").focalLength, 50.0);
}

TEST_F(CameraAttributesTest, ApertureAndCentreTakeTheirFirstNumbers) {
  const MAYA_Camera camera =
      CameraWith("setAttr \".cap\" -type \"double2\" 1.417 0.945 --x;\nsetAttr \".wci\" 4 5 6 --x;");
  EXPECT_THAT(Values(camera.cameraAperture), ElementsAre(1.417, 0.945));
  EXPECT_THAT(Values(camera.worldCenterOfInterest), ElementsAre(4, 5, 6));
}

TEST_F(CameraAttributesTest, MissingComponentsOfApertureAndCentreAreZero) {
  const MAYA_Camera camera =
      CameraWith("setAttr \".wci\" 4 5 6;\nsetAttr \".cap\" 2;\nsetAttr \".wci\" 7 8;");
  EXPECT_THAT(Values(camera.cameraAperture), ElementsAre(2, 0));
  EXPECT_THAT(Values(camera.worldCenterOfInterest), ElementsAre(7, 8, 0));
}

TEST_F(CameraAttributesTest, ApertureAndCentreAreWrittenOnlyWithANumber) {
  const MAYA_Camera camera =
      CameraWith("setAttr \".wci\" 4 5 6;\nsetAttr \".cap\" -type \"double2\";\nsetAttr \".wci\" no;");
  EXPECT_THAT(Values(camera.cameraAperture), ElementsAre(1.4173, 0.9449));
  EXPECT_THAT(Values(camera.worldCenterOfInterest), ElementsAre(4, 5, 6));
}

constexpr const char* kWithoutValue[] = {
    "setAttr \".fl\";",  "setAttr \".fl\" \"x\";",
    "setAttr \".ff\";",  "setAttr \".ff\" off;",
    "setAttr \".cap\";", "setAttr \".cap\" -type \"double2\";",
    "setAttr \".wci\";", "setAttr \".wci\" -type \"double3\";",
    "setAttr \".o\";",   "setAttr \".o\" no;",
    "setAttr \".o\" 1;", "setAttr -k off \".o\" \"yes\";",
};

constexpr const char* kWithValue[] = {
    "setAttr \".fl\" 50;", "setAttr \".ff\" 0;",  "setAttr \".cap\" 1;",
    "setAttr \".wci\" 0;", "setAttr \".o\" yes;",
};

TEST_F(CameraAttributesTest, ACommandWithoutAValueKeepsAConnectionMadeMeanwhile) {
  const auto curveAfter = [this](const char* command) {
    EXPECT_EQ(Read("createNode animCurveTU -n \"focal\";\ncreateNode camera -n \"c\";\n"
                   "connectAttr \"focal.o\" \"c.fl\";\n" +
                   std::string(command)),
              0);
    return CameraAt(0).focalLengthCurve;
  };
  for (const char* const command : kWithoutValue) EXPECT_EQ(curveAfter(command), 0) << command;
  for (const char* const command : kWithValue) EXPECT_EQ(curveAfter(command), -1) << command;
}

TEST_F(CameraAttributesTest, ACommandWithoutAValueLeavesNothingForTheNextToWrite) {
  for (const char* const command : kWithoutValue) {
    SCOPED_TRACE(command);
    const MAYA_Camera camera = CameraWith("setAttr \".fl\" 50; setAttr \".ff\" 2; setAttr \".cap\" 3 4;\n" +
                                          std::string(command) + "\nsetAttr \".wci\" 5 6 7;");
    EXPECT_DOUBLE_EQ(camera.focalLength, 50.0);
    EXPECT_EQ(camera.filmFit, 1);
    EXPECT_THAT(Values(camera.cameraAperture), ElementsAre(3, 4));
    EXPECT_THAT(Values(camera.worldCenterOfInterest), ElementsAre(5, 6, 7));
    EXPECT_EQ(camera.orthographic, 0);
    const MAYA_Camera aimed =
        CameraWith("setAttr \".wci\" 5 6 7;\n" + std::string(command) + "\nsetAttr \".fl\" 50;");
    EXPECT_THAT(Values(aimed.worldCenterOfInterest), ElementsAre(5, 6, 7));
  }
}

TEST_F(CameraAttributesTest, OfTwoCamerasOfANameTheFirstKeepsItsParentWithoutAValue) {
  const auto parentAfter = [this](const char* command) {
    EXPECT_EQ(Read("createNode camera -n \"c\" -p \"one\";\ncreateNode camera -n \"c\" -p \"two\";\n" +
                   std::string(command)),
              0);
    return std::string(CameraAt(0).parent);
  };
  for (const char* const command : kWithoutValue) EXPECT_EQ(parentAfter(command), "one") << command;
  for (const char* const command : kWithValue) EXPECT_EQ(parentAfter(command), "two") << command;
}

TEST_F(CameraAttributesTest, AFailedScanThrowsItsCode) {
  for (const char* const name : {".fl", ".ff", ".cap", ".wci"}) {
    SCOPED_TRACE(name);
    EXPECT_EQ(ReadWith("setAttr \".fl\" 60;\nsetAttr \"" + std::string(name) + "\" --x;"),
              HOST_ERR_NUMBER_SYNTAX);
    EXPECT_DOUBLE_EQ(CameraAt(0).focalLength, 60.0);
    EXPECT_EQ(ReadWith("setAttr \"" + std::string(name) + "\" 1e999;"), HOST_ERR_NUMBER_RANGE);
    EXPECT_THAT(Messages(), IsEmpty());
  }
  EXPECT_EQ(ReadWith("setAttr \".o\" --x yes;"), 0);
  EXPECT_EQ(CameraAt(0).orthographic, 1);
}

TEST_F(CameraAttributesTest, TheFirstCameraOfTheNameReceivesTheWholeCopy) {
  ASSERT_EQ(Read("createNode camera -n \"cam\" -p \"one\";\nsetAttr \".fl\" 50;\n"
                 "createNode camera -n \"CAM\" -p \"two\";\nsetAttr \".ff\" 2;\n"),
            0);
  EXPECT_STREQ(CameraAt(0).name, "CAM");
  EXPECT_STREQ(CameraAt(0).parent, "two");
  EXPECT_DOUBLE_EQ(CameraAt(0).focalLength, 35.0);
  EXPECT_EQ(CameraAt(0).filmFit, 1);
  EXPECT_EQ(CameraAt(1).filmFit, 0);
}

TEST_F(CameraAttributesTest, ATransformOfTheCamerasNameIsAnotherRecord) {
  ASSERT_EQ(Read("createNode transform -n \"c\";\ncreateNode camera -n \"c\";\nsetAttr \".fl\" 50;\n"), 0);
  EXPECT_DOUBLE_EQ(CameraAt(0).focalLength, 50.0);
  EXPECT_EQ(TransformCount(), 1);
}

TEST_F(CameraAttributesTest, TheEndInTheHeadIsNoErrorAndAfterItIsOne) {
  for (const char* const head :
       {"setAttr ", "setAttr -k ", "setAttr -k off ", "setAttr \".v\" ", "setAttr -k off \".v\""}) {
    EXPECT_EQ(ReadWith(head), 0) << head;
    EXPECT_THAT(Messages(), IsEmpty());
  }
  for (const char* const name : {".fl", ".ff", ".cap", ".wci", ".o"}) {
    EXPECT_EQ(Read("createNode camera;\nsetAttr \"" + std::string(name) + "\" 1 "), 1289986) << name;
    EXPECT_THAT(Messages(), ElementsAre(kUnexpectedEndText));
  }
}

}  // namespace
}  // namespace testsupport

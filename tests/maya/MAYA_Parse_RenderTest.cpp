// "select", and "setAttr" on the render settings.
#include "hostapi/ErrorCodes.h"
#include "hostutil/HostSetup.h"
#include "tests/support/ReaderFixture.h"

namespace testsupport {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

class SelectTest : public ReaderTest {
 protected:
  // The current kind after the select command, where a camera was current before.
  std::int32_t KindAfter(std::string_view command) {
    EXPECT_EQ(Read("createNode camera -n \"c\";\n" + std::string(command) + "\n"), 0) << command;
    EXPECT_EQ(CurrentIsZero(), scene().currentKind != kCameraNode) << command;
    return scene().currentKind;
  }
};

TEST_F(SelectTest, TheResolutionBecomesCurrentWithAndWithoutTheColonInAnyCase) {
  for (const std::string& name : CaseChanges("defaultResolution")) {
    EXPECT_EQ(KindAfter("select -ne :" + name + ";"), kRenderSettings);
    EXPECT_EQ(KindAfter("select -ne : " + name + " ;"), kRenderSettings);
    EXPECT_EQ(KindAfter("select " + name + ";"), kRenderSettings);
  }
}

TEST_F(SelectTest, AnyOtherSelectLeavesNoCurrentNode) {
  for (const char* const command :
       {"select -ne :time1;", "select \"a\";", "select a;", "select;", "select -ne ;", "select 5;",
        "select -all;", "select -ne :defaultResolutions;", "select \":defaultResolution\";", "select // c\n;",
        "select file;"})
    EXPECT_EQ(KindAfter(command), kNoNode) << command;
}

TEST_F(SelectTest, AMatchIsRemembered) {
  for (const char* const command :
       {"select -ne :defaultResolution :time1;", "select :defaultResolution \"a\" b 5;",
        "select \"a\" :defaultResolution;", "select a defaultResolution // c\n ;",
        "select :time1 :defaultResolution;"})
    EXPECT_EQ(KindAfter(command), kRenderSettings) << command;
}

TEST_F(SelectTest, AColonBeforeTheSemicolonEndsWithoutClearing) {
  EXPECT_EQ(KindAfter("select :;"), kCameraNode);
  EXPECT_EQ(KindAfter("select -ne :time1 :;"), kCameraNode);
  EXPECT_EQ(KindAfter("select \"a\" :;"), kNoNode);
}

TEST_F(SelectTest, WhatFollowsAColonIsDropped) {
  for (const char* const dropped : {"\"x\"", "5", "file", "-x", ":", "/*c*/", "select"})
    EXPECT_EQ(KindAfter("select : " + std::string(dropped) + " :;"), kCameraNode) << dropped;
}

TEST_F(SelectTest, TheEndInsideASelectIsAnUnexpectedEnd) {
  for (const char* const text : {"select ", "select -ne :defaultResolution ", "select \"a\"", "select :"}) {
    SCOPED_TRACE(text);
    EXPECT_EQ(Read(text), 1289986);
    EXPECT_THAT(Messages(), ElementsAre(kUnexpectedEndText));
  }
}

class RenderTest : public ReaderTest {
 protected:
  HostError ReadWith(std::string_view commands) {
    return Read("select -ne :defaultResolution;\n" + std::string(commands) + "\n");
  }

  void ExpectSettings(std::int32_t width, std::int32_t height, double deviceAspect, double pixelAspect) {
    EXPECT_EQ(scene().resolutionWidth, width);
    EXPECT_EQ(scene().resolutionHeight, height);
    EXPECT_DOUBLE_EQ(scene().deviceAspectRatio, deviceAspect);
    EXPECT_DOUBLE_EQ(scene().pixelAspect, pixelAspect);
  }
};

constexpr double kDeviceAspect = 1.3333333333333333;
constexpr double kPixelAspect = 0.9091;

TEST_F(RenderTest, EachSettingIsKnownInBothFormsAndAnyCase) {
  for (const char* const name : {".w", ".width"})
    for (const std::string& form : CaseChanges(name)) {
      ASSERT_EQ(ReadWith("setAttr \"" + form + "\" 1920;"), 0);
      ExpectSettings(1920, 486, kDeviceAspect, kPixelAspect);
    }
  for (const char* const name : {".h", ".height"})
    for (const std::string& form : CaseChanges(name)) {
      ASSERT_EQ(ReadWith("setAttr \"" + form + "\" 1080;"), 0);
      ExpectSettings(720, 1080, kDeviceAspect, kPixelAspect);
    }
  for (const char* const name : {".dar", ".deviceAspectRatio"})
    for (const std::string& form : CaseChanges(name)) {
      ASSERT_EQ(ReadWith("setAttr \"" + form + "\" 1.7769999504089355;"), 0);
      ExpectSettings(720, 486, 1.7769999504089355, kPixelAspect);
    }
  for (const char* const name : {".pa", ".pixelAspect"})
    for (const std::string& form : CaseChanges(name)) {
      ASSERT_EQ(ReadWith("setAttr \"" + form + "\" 1.5;"), 0);
      ExpectSettings(720, 486, kDeviceAspect, 1.5);
    }
}

TEST_F(RenderTest, SizesAreTruncatedTowardZero) {
  ASSERT_EQ(ReadWith("setAttr \".w\" 1920.9;\nsetAttr \".height\" -0.9;"), 0);
  ExpectSettings(1920, 0, kDeviceAspect, kPixelAspect);
  ASSERT_EQ(ReadWith("setAttr \".width\" -5;\nsetAttr \".h\" -7.99;"), 0);
  ExpectSettings(-5, -7, kDeviceAspect, kPixelAspect);
}

TEST_F(RenderTest, SizesAreHeldAtTheEndsOfTheirRange) {
  ASSERT_EQ(ReadWith("setAttr \".w\" 1e300;\nsetAttr \".h\" -1e300;"), 0);
  ExpectSettings(2147483647, -2147483647 - 1, kDeviceAspect, kPixelAspect);
  ASSERT_EQ(ReadWith("setAttr \".w\" 2147483648;\nsetAttr \".h\" -2147483648.5;"), 0);
  ExpectSettings(2147483647, -2147483647 - 1, kDeviceAspect, kPixelAspect);
  ASSERT_EQ(ReadWith("setAttr \".w\" 2147483646.9;\nsetAttr \".h\" -2147483647.9;"), 0);
  ExpectSettings(2147483646, -2147483647, kDeviceAspect, kPixelAspect);
}

TEST_F(RenderTest, WhatIsNoNumberIsDropped) {
  ASSERT_EQ(ReadWith("setAttr \".w\" \"x\";\nsetAttr \".h\" yes 5;\nsetAttr \".dar\" \".pa\" 3;\nsetAttr "
                     "\".pa\" /*c*/ 4;"),
            0);
  ExpectSettings(720, 486, kDeviceAspect, kPixelAspect);
}

TEST_F(RenderTest, ASemicolonInPlaceOfTheNumberEndsTheCommand) {
  ASSERT_EQ(ReadWith("setAttr \".w\"; \".h\" 5;"), 0);
  ExpectSettings(720, 486, kDeviceAspect, kPixelAspect);
}

TEST_F(RenderTest, OneCommandMayCarrySeveralSettings) {
  ASSERT_EQ(ReadWith("setAttr -k on \".w\" 640 \".foo\" 9 \".h\" 480 yes \".dar\" 2.5 8 \".pa\" 0.5;"), 0);
  ExpectSettings(640, 480, 2.5, 0.5);
}

TEST_F(RenderTest, TheCommandIsReadToItsSemicolonWhateverItsName) {
  ASSERT_EQ(ReadWith("setAttr \".foo\" createNode camera -n \"c\";"), 0);
  EXPECT_EQ(CameraCount(), 0);
  for (const char* const name : {".wd", "w", ".w[0]", ".t", ""}) {
    ASSERT_EQ(ReadWith("setAttr \"" + std::string(name) + "\" 5;"), 0);
    ExpectSettings(720, 486, kDeviceAspect, kPixelAspect);
  }
}

TEST_F(RenderTest, ALaterValueReplacesAnEarlierOne) {
  ASSERT_EQ(ReadWith("setAttr \".w\" 5 \".w\" 6;\nsetAttr \".width\" 7;"), 0);
  EXPECT_EQ(scene().resolutionWidth, 7);
}

TEST_F(RenderTest, TheSettingsStayAfterAnotherNodeIsCurrent) {
  ASSERT_EQ(ReadWith("setAttr \".w\" 5;\nselect -ne :time1;\nsetAttr \".w\" 6;"), 0);
  EXPECT_EQ(scene().resolutionWidth, 5);
}

TEST_F(RenderTest, AFailedScanThrowsItsCode) {
  for (const char* const name : {".w", ".h", ".dar", ".pa"}) {
    EXPECT_EQ(ReadWith("setAttr \"" + std::string(name) + "\" --x;"), HOST_ERR_NUMBER_SYNTAX);
    ExpectSettings(720, 486, kDeviceAspect, kPixelAspect);
    EXPECT_EQ(ReadWith("setAttr \"" + std::string(name) + "\" 1e999;"), HOST_ERR_NUMBER_RANGE);
    ExpectSettings(720, 486, kDeviceAspect, kPixelAspect);
    EXPECT_THAT(Messages(), IsEmpty());
  }
  EXPECT_EQ(ReadWith("setAttr \".foo\" --x;"), 0);
}

TEST_F(RenderTest, TheEndInsideTheCommandIsAnUnexpectedEnd) {
  for (const char* const text : {"setAttr ", "setAttr \".w\"", "setAttr \".w\" 5 ", "setAttr \".foo\" "}) {
    SCOPED_TRACE(text);
    EXPECT_EQ(ReadWith(text), 1289986);
    EXPECT_THAT(Messages(), ElementsAre(kUnexpectedEndText));
  }
}

}  // namespace
}  // namespace testsupport

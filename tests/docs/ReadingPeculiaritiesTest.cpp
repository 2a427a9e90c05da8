// What docs/peculiarities.md says about reading a scene, seen from outside.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "hostapi/ErrorCodes.h"
#include "tests/docs/SceneImport.h"

namespace docs_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

constexpr double kTolerance = 1e-9;
constexpr double kDoubleZoom = 2.0 * kDefaultZoom;  // of a focal length of 70

TEST(ReadingPeculiarities, FileThatIsNoSceneGivesAMessageAndReturnsZero) {
  const SceneImport import("createNode camera -n \"c\";\n");
  EXPECT_EQ(import.result().code, 0);
  EXPECT_THAT(import.result().messages, ElementsAre("Only Baked Maya Ascii files are supported."));
  EXPECT_THAT(import.project().compositions(), IsEmpty());
}

TEST(ReadingPeculiarities, HeaderIsTakenInAnyCase) {
  const SceneImport import("//mAYa ASCII\ncreateNode camera -n \"c\";\n");
  EXPECT_EQ(import.result().code, 0);
  EXPECT_EQ(import.LayersNamed("c"), 1u);
}

TEST(ReadingPeculiarities, FileShorterThanTenBytesIsRefusedWithoutAMessage) {
  const SceneImport import("//Maya 1\n");
  EXPECT_EQ(import.result().code, HOST_ERR_FILE_SHORT_READ);
  EXPECT_THAT(import.result().messages, IsEmpty());
}

TEST(ReadingPeculiarities, LineCommentThatEndsTheFileIsRefused) {
  const SceneImport import("//Maya ASCII\ncreateNode camera -n \"c\";\n// End of scene");
  EXPECT_EQ(import.result().code, HOST_ERR_MAYA_UNEXPECTED_END);
  EXPECT_THAT(import.result().messages, ElementsAre("Unexpected end of maya file."));
}

TEST(ReadingPeculiarities, WordThatEndsTheFileIsRefused) {
  const SceneImport import("//Maya ASCII\ncreateNode camera -n \"c\";\nquit");
  EXPECT_EQ(import.result().code, HOST_ERR_MAYA_UNEXPECTED_END);
}

TEST(ReadingPeculiarities, SlashThreeStarsSlashLeavesTheCommentOpen) {
  const SceneImport import(
      Scene("/***/ createNode camera -n \"hidden\"; /* */ createNode camera -n \"seen\";"));
  EXPECT_EQ(import.LayersNamed("hidden"), 0u);
  EXPECT_EQ(import.LayersNamed("seen"), 1u);
}

TEST(ReadingPeculiarities, EscapedBackslashBeforeAQuoteKeepsTheStringOpen) {
  const SceneImport import(Scene("createNode camera -n \"c\\\\\";"));
  EXPECT_EQ(import.result().code, HOST_ERR_MAYA_UNEXPECTED_END);
}

TEST(ReadingPeculiarities, KeywordInsideAnIgnoredCommandActs) {
  const SceneImport import(Scene("rename oldName createNode camera -n \"c\";"));
  EXPECT_EQ(import.LayersNamed("c"), 1u);
}

TEST(ReadingPeculiarities, WordThatBeginsWithAnotherCharacterStopsTheImport) {
  for (const char* word : {"{ }", "|group1|cam", "_private", "#remark"}) {
    const SceneImport import(Scene(std::string("parent ") + word + ";"));
    EXPECT_EQ(import.result().code, HOST_ERR_MAYA_SYNTAX) << word;
    EXPECT_THAT(import.result().messages, ElementsAre("Error reading Maya file.")) << word;
  }
}

TEST(ReadingPeculiarities, LettersAfterANumberAreIgnored) {
  const SceneImport import(Scene("createNode camera -n \"c\"; setAttr \".fl\" 70mm;"));
  EXPECT_NEAR(import.Value("c", kZoom), kDoubleZoom, kTolerance);
}

TEST(ReadingPeculiarities, NameWithoutQuotesIsNotTaken) {
  const SceneImport import(Scene("createNode camera -n cam1;"));
  EXPECT_EQ(import.LayersNamed(""), 1u);
  EXPECT_EQ(import.LayersNamed("cam1"), 0u);
}

TEST(ReadingPeculiarities, NameOf253BytesIsEmpty) {
  const std::string taken(252, 'a');
  const std::string tooLong(253, 'b');
  const SceneImport import(
      Scene("createNode camera -n \"" + taken + "\"; createNode camera -n \"" + tooLong + "\";"));
  EXPECT_EQ(import.LayersNamed(taken), 1u);
  EXPECT_EQ(import.LayersNamed(""), 1u);
}

TEST(ReadingPeculiarities, FirstNodeOfANameGetsTheValuesOfAll) {
  const SceneImport import(
      Scene("createNode camera -n \"c\"; createNode camera -n \"C\"; setAttr \".fl\" 70;"));
  ASSERT_EQ(import.project().layers().size(), 2u);
  EXPECT_NEAR(import.project().layers()[0].findStream(kZoom)->value[0], kDoubleZoom, kTolerance);
  EXPECT_NEAR(import.project().layers()[1].findStream(kZoom)->value[0], kDefaultZoom, kTolerance);
}

TEST(ReadingPeculiarities, NodeTypeInQuotesLeavesTheNodeBeforeCurrent) {
  const SceneImport import(
      Scene("createNode camera -n \"c\"; createNode \"mesh\" -n \"m\"; setAttr \".fl\" 70;"));
  EXPECT_NEAR(import.Value("c", kZoom), kDoubleZoom, kTolerance);
}

TEST(ReadingPeculiarities, OptionOfACameraAttributeEatsTheNextToken) {
  {
    const SceneImport plain(Scene("createNode camera -n \"c\"; setAttr -k off \".fl\" 70;"));
    EXPECT_NEAR(plain.Value("c", kZoom), kDoubleZoom, kTolerance);
  }
  {
    const SceneImport eaten(Scene("createNode camera -n \"c\"; setAttr -l \".fl\" 70;"));
    EXPECT_NEAR(eaten.Value("c", kZoom), kDefaultZoom, kTolerance);
  }
}

TEST(ReadingPeculiarities, OptionBeforeATransformAttributeMakesItIgnored) {
  const SceneImport import(Scene(Camera("setAttr -k off \".t\" -type \"double3\" 1 2 3;")));
  EXPECT_NEAR(import.Value("camShape", kPosition), 0.0, kTolerance);
}

TEST(ReadingPeculiarities, OptionOfACurveEatsTheSemicolon) {
  const SceneImport import(
      Scene("createNode animCurveTL -n \"k\"; setAttr -lock; createNode camera -n \"lost\";\n"
            "createNode camera -n \"seen\";"));
  EXPECT_EQ(import.LayersNamed("lost"), 0u);
  EXPECT_EQ(import.LayersNamed("seen"), 1u);
}

TEST(ReadingPeculiarities, MissingComponentTakesItsStartValue) {
  const SceneImport import(
      Scene(Camera("setAttr \".t\" -type \"double3\" 1 2 3; setAttr \".t\" -type \"double3\" 7;"
                   "setAttr \".s\" -type \"double3\" 4;")));
  EXPECT_NEAR(import.Value("camShape", kPosition, 0), 7.0, kTolerance);
  EXPECT_NEAR(import.Value("camShape", kPosition, 1), 0.0, kTolerance);
  EXPECT_NEAR(import.Value("camShape", kScale, 0), 400.0, kTolerance);
  EXPECT_NEAR(import.Value("camShape", kScale, 1), 100.0, kTolerance);
}

TEST(ReadingPeculiarities, AttributeOfOneAxisIsNotRead) {
  const SceneImport import(Scene(Camera("setAttr \".tx\" 5;")));
  EXPECT_NEAR(import.Value("camShape", kPosition), 0.0, kTolerance);
}

TEST(ReadingPeculiarities, OrthographicCameraStaysSo) {
  const SceneImport import(Scene("createNode camera -n \"c\"; setAttr \".o\" yes; setAttr \".o\" no;"));
  EXPECT_EQ(import.project().compositions().size(), 1u);
  EXPECT_EQ(import.LayersNamed("c"), 0u);
}

TEST(ReadingPeculiarities, ParentCommandChangesNothing) {
  const SceneImport import(Scene("createNode transform -n \"rig\";" + Camera() + "parent \"cam\" \"rig\";"));
  EXPECT_EQ(import.project().layers().size(), 1u);
}

TEST(ReadingPeculiarities, AttributeAfterAConnectionClearsIt) {
  const std::string curve = Curve("k", "1 0 2 5");
  const std::string transform = "createNode transform -n \"cam\";\n";
  const std::string camera = "createNode camera -n \"camShape\" -p \"cam\";\n";
  {
    const SceneImport cleared(
        Scene(curve + transform + Drive("k", "cam.tx") + "setAttr \".r\" -type \"double3\" 0 0 0;" + camera));
    EXPECT_EQ(cleared.KeyCount("camShape", kPosition), 0u);
  }
  {
    const SceneImport kept(
        Scene(curve + transform + "setAttr \".r\" -type \"double3\" 0 0 0;" + Drive("k", "cam.tx") + camera));
    EXPECT_EQ(kept.KeyCount("camShape", kPosition), 2u);
  }
}

TEST(ReadingPeculiarities, KeyAttributeIsLookedForWithItsCase) {
  const SceneImport import(
      Scene(Camera() + "createNode animCurveTL -n \"k\";\nsetAttr \".KTV\" 1 0 2 5;" + Drive("k", "cam.tx")));
  EXPECT_EQ(import.KeyCount("camShape", kPosition), 0u);
}

TEST(ReadingPeculiarities, KeyWithoutAValueIsZero) {
  const SceneImport import(Scene(Camera() + Curve("k", "1 8 2") + Drive("k", "cam.tx")));
  ASSERT_EQ(import.KeyCount("camShape", kPosition), 2u);
  EXPECT_NEAR(import.KeyValue("camShape", kPosition, 0), 8.0, kTolerance);
  EXPECT_NEAR(import.KeyValue("camShape", kPosition, 1), 0.0, kTolerance);
}

TEST(ReadingPeculiarities, SelectLeavesNoNodeCurrentUnlessItEndsAfterAColon) {
  {
    const SceneImport cleared(Scene("createNode camera -n \"c\"; select -ne :time1; setAttr \".fl\" 70;"));
    EXPECT_NEAR(cleared.Value("c", kZoom), kDefaultZoom, kTolerance);
  }
  {
    const SceneImport kept(Scene("createNode camera -n \"c\"; select :; setAttr \".fl\" 70;"));
    EXPECT_NEAR(kept.Value("c", kZoom), kDoubleZoom, kTolerance);
  }
}

}  // namespace
}  // namespace docs_test

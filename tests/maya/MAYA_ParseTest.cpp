// Defaults, dispatch, and the copying of tokens.
#include "maya/MAYA_Parse.h"

#include <cstring>

#include "tests/support/ReaderFixture.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using namespace std::string_view_literals;
using ::testing::Each;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

class ParseTest : public ReaderTest {};

TEST_F(ParseTest, AnEmptySceneKeepsEveryDefault) {
  EXPECT_EQ(Read(""), 0);
  EXPECT_EQ(scene().currentKind, 0);
  EXPECT_TRUE(CurrentIsZero());
  EXPECT_EQ(scene().timeUnit, 3);
  EXPECT_DOUBLE_EQ(scene().frameRate, 29.97);
  EXPECT_EQ(scene().angleUnit, 1);
  EXPECT_EQ(scene().linearUnit, 2);
  EXPECT_EQ(scene().resolutionWidth, 720);
  EXPECT_EQ(scene().resolutionHeight, 486);
  EXPECT_DOUBLE_EQ(scene().deviceAspectRatio, 1.3333333333333333);
  EXPECT_DOUBLE_EQ(scene().pixelAspect, 0.9091);
  EXPECT_EQ(scene().transforms, nullptr);
  EXPECT_EQ(scene().cameras, nullptr);
  EXPECT_EQ(scene().curves, nullptr);
  EXPECT_EQ(scene().locators, nullptr);
}

TEST_F(ParseTest, ANullTextIsAnEmptyScene) {
  MAYA_Parse parse(host_.basicSuite(), nullptr);
  parse.Parse();
  EXPECT_EQ(parse.transforms, nullptr);
  EXPECT_EQ(parse.currentKind, 0);
}

TEST_F(ParseTest, ASceneWithoutUnitsAndResolutionKeepsTheSettings) {
  ASSERT_EQ(Read("createNode transform -n \"a\";\nsetAttr \".t\" 1 2 3;\n"), 0);
  EXPECT_EQ(scene().timeUnit, 3);
  EXPECT_DOUBLE_EQ(scene().frameRate, 29.97);
  EXPECT_EQ(scene().angleUnit, 1);
  EXPECT_EQ(scene().linearUnit, 2);
  EXPECT_EQ(scene().resolutionWidth, 720);
  EXPECT_EQ(scene().resolutionHeight, 486);
  EXPECT_DOUBLE_EQ(scene().deviceAspectRatio, 4.0 / 3.0);
  EXPECT_DOUBLE_EQ(scene().pixelAspect, 0.9091);
}

TEST_F(ParseTest, TheNodeTypesOfTheTableMakeTheirRecords) {
  struct Row {
    const char* type;
    std::int32_t kind;
  };
  const std::vector<Row> rows = {
      {"transform", kTransformNode},    {"stereoRigTransform", kTransformNode},
      {"lookAt", kTransformNode},       {"aimConstraint", kTransformNode},
      {"locator", kLocatorNode},        {"camera", kCameraNode},
      {"stereoRigCamera", kCameraNode}, {"animCurveTL", kCurveNode},
      {"animCurveTA", kCurveNode},      {"animCurveTU", kCurveNode},
  };
  for (const Row& row : rows) {
    for (const std::string& type : CaseChanges(row.type)) {
      SCOPED_TRACE(type);
      ASSERT_EQ(Read("createNode " + type + " -n \"node\" -p \"above\";\n"), 0);
      EXPECT_EQ(scene().currentKind, row.kind);
      EXPECT_EQ(TransformCount(), row.kind == kTransformNode ? 1 : 0);
      EXPECT_EQ(CameraCount(), row.kind == kCameraNode ? 1 : 0);
      EXPECT_EQ(CurveCount(), row.kind == kCurveNode ? 1 : 0);
      EXPECT_EQ(LocatorCount(), row.kind == kLocatorNode ? 1 : 0);
      EXPECT_STREQ(scene().current.transform.name, "node");
      EXPECT_STREQ(scene().current.transform.parent, "above");
    }
  }
}

TEST_F(ParseTest, AnUnknownNodeTypeLeavesNoCurrentNode) {
  for (const char* const type :
       {"mesh", "transforms", "animCurveUU", "animCurveTT", "pointConstraint", "orientConstraint"}) {
    SCOPED_TRACE(type);
    ASSERT_EQ(Read("createNode transform -n \"a\";\ncreateNode " + std::string(type) +
                   " -n \"m1\";\nsetAttr \".t\" 1 2 3;\n"),
              0);
    EXPECT_EQ(scene().currentKind, 0);
    EXPECT_TRUE(CurrentIsZero());
    EXPECT_EQ(TransformCount(), 1);
    EXPECT_THAT(Values(TransformAt(0).translate), Each(0.0));
  }
}

TEST_F(ParseTest, SetAttrAfterAMeshStoresNothing) {
  ASSERT_EQ(Read("createNode mesh -n \"m1\";\nsetAttr \".t\" -type \"double3\" 1 2 3;\n"), 0);
  EXPECT_EQ(scene().transforms, nullptr);
  EXPECT_TRUE(CurrentIsZero());
}

TEST_F(ParseTest, ANodeTypeThatIsNoIdentifierLeavesTheCurrentNode) {
  for (const char* const type : {"\"transform\"", "file", "select -ne", "12", "-n", ";", "/*c*/", "(", ":"}) {
    SCOPED_TRACE(type);
    // "select" would take the command's tokens as its own if it were met by the main loop.
    ASSERT_EQ(Read("createNode camera -n \"c\";\ncreateNode " + std::string(type) +
                   " \"x\";\nsetAttr \".fl\" 50;\n"),
              0);
    EXPECT_EQ(scene().currentKind, kCameraNode);
    EXPECT_EQ(TransformCount(), 0);
    EXPECT_EQ(CameraCount(), 1);
    EXPECT_DOUBLE_EQ(CameraAt(0).focalLength, 50.0);
  }
}

TEST_F(ParseTest, ANodeTypeOf255BytesReadsAsEmptyAndIsUnknown) {
  ASSERT_EQ(Read("createNode camera -n \"c\";\ncreateNode " + std::string(255, 'c') + " -n \"x\";\n"), 0);
  EXPECT_EQ(scene().currentKind, 0);
  EXPECT_EQ(CameraCount(), 1);
}

TEST_F(ParseTest, ACopiedNodeTypeEndsAtItsFirstNul) {
  ASSERT_EQ(Read("createNode transform\0mesh -n \"a\";\n"sv), 0);
  EXPECT_EQ(TransformCount(), 1);
}

TEST_F(ParseTest, TheEndInPlaceOfANodeTypeEndsTheSceneInGoodOrder) {
  EXPECT_EQ(Read("createNode camera -n \"c\";\ncreateNode "), 0);
  EXPECT_EQ(scene().currentKind, kCameraNode);
  EXPECT_EQ(Read("createNode \0createNode camera -n \"c\";\n"sv), 0);
  EXPECT_EQ(CameraCount(), 0);
  EXPECT_THAT(Messages(), IsEmpty());
}

TEST_F(ParseTest, AnEmbeddedNulBetweenCommandsEndsTheScene) {
  ASSERT_EQ(Read("createNode transform -n \"a\";\n\0createNode camera -n \"c\";\n"sv), 0);
  EXPECT_EQ(TransformCount(), 1);
  EXPECT_EQ(CameraCount(), 0);
  EXPECT_THAT(Messages(), IsEmpty());
}

TEST_F(ParseTest, AnEmbeddedNulInAWordIsPassedOver) {
  ASSERT_EQ(Read("createNode transform -n \"a\";\nab\0cd;\ncreateNode camera -n \"c\";\n"sv), 0);
  EXPECT_EQ(TransformCount(), 1);
  EXPECT_EQ(CameraCount(), 1);
}

TEST_F(ParseTest, IgnoredCommandsChangeNothing) {
  for (const char* const command :
       {"parent -s -nc \"camera1\" \"group1\";", "addAttr -ci true -sn \"x\" -ln \"xx\" -at \"double\";",
        "disconnectAttr \"a.o\" \"camera1.tx\";", "file -rdi 1 -ns \"r\" \"r.ma\";",
        "requires maya \"2020\";", "fileInfo \"application\" \"maya\";", "lockNode -l 1 ;",
        "rename -uid \"5\";", "// a comment\n", "( ) + : - \"text\" 12 -x;"}) {
    SCOPED_TRACE(command);
    ASSERT_EQ(Read("createNode animCurveTL -n \"a\";\ncreateNode transform -n \"group1\";\n"
                   "createNode transform -n \"camera1\";\n" +
                   std::string(command) + "\nsetAttr \".t\" 4 5 6;\n"),
              0);
    EXPECT_EQ(scene().currentKind, kTransformNode);
    EXPECT_EQ(TransformCount(), 2);
    EXPECT_THAT(Values(TransformAt(1).translate), ElementsAre(4, 5, 6));
    EXPECT_STREQ(TransformAt(1).parent, "");
    EXPECT_THAT(Values(TransformAt(1).curve), Each(-1));
  }
}

TEST_F(ParseTest, KeywordsAreFoundInsideIgnoredCommands) {
  ASSERT_EQ(Read("file -r select -ne :defaultResolution;\nsetAttr \".w\" 100;\n"), 0);
  EXPECT_EQ(scene().resolutionWidth, 100);
  ASSERT_EQ(Read("rename createNode camera -n \"c\";\n"), 0);
  EXPECT_EQ(CameraCount(), 1);
  ASSERT_EQ(Read("print currentUnit -l inch;\n"), 0);
  EXPECT_EQ(scene().linearUnit, 5);
}

TEST_F(ParseTest, SetAttrWithoutACurrentNodeOrOnALocatorIsSkippedByTheMainLoop) {
  for (const char* const before : {"", "createNode locator -n \"l\";\n", "createNode mesh;\n"}) {
    SCOPED_TRACE(before);
    const std::string text = std::string(before) + "setAttr \".t\" 1 2 createNode camera -n \"c\";\n";
    ASSERT_EQ(Read(text), 0);
    EXPECT_EQ(CameraCount(), 1);
  }
}

TEST_F(ParseTest, SetAttrGoesToTheParserOfTheCurrentKind) {
  ASSERT_EQ(Read("createNode transform -n \"t\";\nsetAttr \".t\" 1 2 3;\n"
                 "createNode camera -n \"c\";\nsetAttr \".fl\" 44;\n"
                 "createNode animCurveTL -n \"a\";\nsetAttr \".ktv\" 5 6;\n"
                 "select -ne :defaultResolution;\nsetAttr \".h\" 77;\n"),
            0);
  EXPECT_THAT(Values(TransformAt(0).translate), ElementsAre(1, 2, 3));
  EXPECT_DOUBLE_EQ(CameraAt(0).focalLength, 44.0);
  EXPECT_EQ(KeysOf(0), (Keys{{5, 6}}));
  EXPECT_EQ(scene().resolutionHeight, 77);
}

TEST_F(ParseTest, ParseSetAttrIsTheSameSwitchAsAnOperation) {
  const GuardedText text("\".fl\" 61; \".t\" 1 2 3;");
  MAYA_Parse parse(host_.basicSuite(), text.begin(), text.end());
  parse.currentKind = kCameraNode;
  parse.ParseSetAttr();
  EXPECT_DOUBLE_EQ(parse.current.camera.focalLength, 61.0);

  const char* const afterCamera = parse.position;
  parse.currentKind = kLocatorNode;
  parse.ParseSetAttr();
  parse.currentKind = kNoNode;
  parse.ParseSetAttr();
  EXPECT_EQ(parse.position, afterCamera);

  parse.currentKind = kTransformNode;
  parse.ParseSetAttr();
  EXPECT_THAT(Values(parse.current.transform.translate), ElementsAre(1, 2, 3));
}

TEST_F(ParseTest, TheOperationsWithoutABodyReadNothing) {
  const GuardedText text("\"a\" \"b\";");
  MAYA_Parse parse(host_.basicSuite(), text.begin(), text.end());
  parse.ParseParent();
  parse.ParseTransformParent();
  parse.ParseCameraParent();
  parse.ParseLocatorSetAttr();
  EXPECT_EQ(parse.position, text.begin());
  EXPECT_EQ(parse.currentKind, 0);
}

TEST_F(ParseTest, RecordsMadeBeforeAnErrorStay) {
  EXPECT_EQ(Read("createNode transform -n \"a\";\ncreateNode camera -n \"c\";\n$"), 1289985);
  EXPECT_EQ(TransformCount(), 1);
  EXPECT_EQ(CameraCount(), 1);
  EXPECT_THAT(Messages(), ElementsAre(kReadingText));
}

TEST_F(ParseTest, BuildStringCopiesUpTo254Bytes) {
  for (const std::size_t size : {1u, 2u, 100u, 253u, 254u, 255u, 256u, 1000u}) {
    SCOPED_TRACE(size);
    const std::string token = "<" + std::string(size - 1, 'x');
    char text[kNameCapacity];
    std::memset(text, '#', sizeof(text));
    std::int32_t length = -7;
    MAYA_Parse::BuildString(token.data(), token.data() + size - 1, &length, text);
    EXPECT_EQ(length, size <= 254 ? static_cast<std::int32_t>(size) : 0);
    EXPECT_EQ(std::string(text), size <= 254 ? token : "");
  }
}

TEST_F(ParseTest, BuildQuoteCountsTheQuotesButDropsThem) {
  for (const std::size_t size : {2u, 3u, 254u, 255u, 256u, 1000u}) {
    SCOPED_TRACE(size);
    const std::string inner(size - 2, 'y');
    const std::string token = "\"" + inner + "\"";
    char text[kNameCapacity];
    std::memset(text, '#', sizeof(text));
    std::int32_t length = -7;
    MAYA_Parse::BuildQuote(token.data(), token.data() + size - 1, &length, text);
    EXPECT_EQ(length, size <= 254 ? static_cast<std::int32_t>(size) : 0);
    EXPECT_EQ(std::string(text), size <= 254 ? inner : "");
  }
}

TEST_F(ParseTest, ACopiedTextEndsAtItsFirstNul) {
  const std::string_view token = "ab\0cd"sv;
  char text[kNameCapacity];
  std::int32_t length = 0;
  MAYA_Parse::BuildString(token.data(), token.data() + token.size() - 1, &length, text);
  EXPECT_STREQ(text, "ab");
}

TEST_F(ParseTest, DestructionDisposesOfEveryList) {
  ASSERT_EQ(Read("createNode transform -n \"t\";\ncreateNode camera -n \"c\";\ncreateNode locator -n \"l\";\n"
                 "createNode animCurveTL -n \"a\";\nsetAttr \".ktv\" 1 2;\n"
                 "createNode animCurveTA -n \"b\";\n"),
            0);
  EXPECT_EQ(HeldObjects().size(), 5u);
  EndScene();
  EXPECT_THAT(HeldObjects(), IsEmpty());
}

}  // namespace
}  // namespace testsupport

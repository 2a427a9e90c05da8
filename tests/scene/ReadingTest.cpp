// What cannot be read costs its own command and nothing else.
#include "tests/scene/SceneFixture.h"

namespace scene {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class ReadingTest : public SceneTest {
 protected:
  // Reads a node, the bad text on line 2, and a second node from line 3 on; both must be there.
  std::vector<std::string> Between(std::string_view bad) {
    Read("createNode transform -n \"before\";\n" + std::string(bad) +
         "\ncreateNode transform -n \"after\";\n");
    EXPECT_THAT(Paths(), ElementsAre("|before", "|after")) << bad;
    return Diagnostics();
  }
};

TEST_F(ReadingTest, CommentsAndBlanksAreNoCommands) {
  Read(
      "//Maya ASCII 2020 scene\n/* ; \" */ ;;\r\n\t createNode/**/transform // -n \"x\"\n-n \"y\"/* a\nb "
      "*/;//");
  EXPECT_THAT(Paths(), ElementsAre("|y"));
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(ReadingTest, AnEmptyTextIsAnEmptyScene) {
  Read("");
  EXPECT_THAT(Paths(), IsEmpty());
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(ReadingTest, AByteOrderMarkIsPassedOver) {
  Read("\xef\xbb\xbf//Maya ASCII\ncreateNode transform -n \"a\";");
  EXPECT_THAT(Paths(), ElementsAre("|a"));
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(ReadingTest, LinesMayEndWithACarriageReturnAlone) {
  Read("//Maya ASCII\rcreateNode transform -n \"a\";\r//x\r\tsetAttr \".tx\" 3;\r");
  EXPECT_EQ(scene_.Number(At("a"), "tx"), 3.0);
}

TEST_F(ReadingTest, ASemicolonInAStringEndsNothing) {
  EXPECT_THAT(Between("setAttr \".nts\" -type \"string\" \"a; createNode transform;\";"), IsEmpty());
  EXPECT_THAT(Between("someCommand \"a\\\";\" \"\\\\\";"), IsEmpty());
}

TEST_F(ReadingTest, AStringOverSeveralLinesIsAString) {
  Read(
      "createNode script -n \"s\";setAttr \".b\" -type \"string\" \"first\nsecond;\n\nselect -r $x;\nrename "
      "$y;\n}\";\n"
      "createNode transform -n \"after\";");
  EXPECT_EQ(scene_.Written(0, "b")->String(), "first\nsecond;\n\nselect -r $x;\nrename $y;\n}");
  EXPECT_THAT(Paths(), ElementsAre("|s", "|after"));
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(ReadingTest, AnOpenStringEndsBeforeTheNextCommand) {
  for (const char* bad :
       {"setAttr \".n\" -type \"string\" \"open;", "setAttr \".n\" -type \"string\" \"open\n\t\tmore;",
        "rename \"open;", "someCommand \"open;", "setAttr \".n\" -type \"string\" open\";", "file -r \"open",
        "createNode transform -n \"open;", "setAttr \".tx\" 5 \"open;", "addAttr -ln \"open;"}) {
    const std::vector<std::string> shown = Between(bad);
    EXPECT_THAT(shown, ElementsAre(testing::HasSubstr("this string has no closing quote [MA0101]"))) << bad;
  }
}

TEST_F(ReadingTest, AnOpenStringIsReportedAtItsQuote) {
  EXPECT_THAT(Between("setAttr \".n\" -type \"string\" \"open;"),
              ElementsAre("2:29: this string has no closing quote [MA0101]"));
}

TEST_F(ReadingTest, AnOpenCommentEndsBeforeTheNextCommand) {
  EXPECT_THAT(Between("/* open"), ElementsAre("2:1: this comment has no end [MA0102]"));
  EXPECT_THAT(Between("/* open\n; \" and more"), ElementsAre("2:1: this comment has no end [MA0102]"));
  EXPECT_THAT(Between("setAttr \".tx\" /* open\n5;"),
              ElementsAre("2:15: this comment has no end [MA0102]",
                          "2:1: the command \"setAttr\" has no \";\" before the next command [MA0104]"));
  EXPECT_THAT(Between("someCommand /* open\n; \""), ElementsAre("2:13: this comment has no end [MA0102]"));
  EXPECT_THAT(Between("setAttr \".tx\" 5 /* open"), ElementsAre("2:17: this comment has no end [MA0102]"));
  EXPECT_THAT(Between("/* one\nsetAttr \".tx\" 5;\n/* two"),
              ElementsAre("2:1: this comment has no end [MA0102]", "4:1: this comment has no end [MA0102]"));
  EXPECT_EQ(scene_.Number(At("before"), "tx"), 5.0);
}

TEST_F(ReadingTest, ACommandWithoutAnEndIsPassedOver) {
  for (const char* bad :
       {"setAttr \".tx\" 5", "setAttr", "setAttr \".tx\"", "createNode transform -n \"x\"", "rename",
        "someCommand 1 2", "setAttr -s 3 \".ktv[0:2]\" 1 2\n\t\t3 4", "connectAttr \"a.o\""}) {
    const std::vector<std::string> shown = Between(bad);
    EXPECT_THAT(shown, ElementsAre(testing::HasSubstr("\" has no \";\" before the next command [MA0104]")))
        << bad;
    EXPECT_EQ(scene_.Number(At("before"), "tx"), 0.0) << bad;
  }
}

TEST_F(ReadingTest, DataPassedOverEndBeforeEveryCommand) {
  const std::string_view commands[] = {
      "addAttr", "applyMetadata", "connectAttr",  "createNode", "currentUnit", "dataStructure",
      "file",    "fileInfo",      "lockNode",     "namespace",  "parent",      "disconnectAttr",
      "rename",  "requires",      "relationship", "select",     "setAttr",
  };
  for (const std::string_view command : commands) {
    for (const std::string_view indent : {"", "\t", " \t  "}) {
      Read("someData 1 2\n\tf 3 0 1 2\n\t\tmu 0 3\n\tfil 1\n\t\t-5 .5\n" + std::string(indent) +
           std::string(command) + " ;");
      ASSERT_FALSE(Diagnostics().empty()) << command;
      EXPECT_EQ(Diagnostics().front(),
                "1:1: the command \"someData\" has no \";\" before the next command [MA0104]")
          << command;
    }
  }
}

TEST_F(ReadingTest, AFileThatEndsInACommandIsReported) {
  for (const char* bad :
       {"setAttr \".tx\" 5", "setAttr", "createNode camera -n \"x\"", "someCommand 5 ", "file -r"}) {
    Read(std::string("createNode transform -n \"a\";\n") + bad);
    EXPECT_THAT(Diagnostics(), ElementsAre(testing::StartsWith("2:1: the file ends inside the command \"")))
        << bad;
    EXPECT_THAT(Paths(), ElementsAre("|a")) << bad;
    EXPECT_EQ(scene_.Number(0, "tx"), 0.0) << bad;
  }
}

TEST_F(ReadingTest, ALastLineWithoutAnEndIsNoMatter) {
  Read("createNode transform -n \"a\";\n// End of a.ma");
  EXPECT_THAT(Diagnostics(), IsEmpty());
}

TEST_F(ReadingTest, ConflictMarksAreLinesOfTheirOwn) {
  Read(
      "createNode camera -n \"c\";\n<<<<<<< HEAD\n\tsetAttr \".fl\" 30;\n=======\n\tsetAttr \".fl\" 50;\n"
      ">>>>>>> 428df34\n\tsetAttr \".coi\" 8;\n||||||| base\n");
  EXPECT_EQ(scene_.Number(0, "fl"), 50.0);
  EXPECT_EQ(scene_.Number(0, "coi"), 8.0);
  EXPECT_THAT(Diagnostics(), ElementsAre("2:1: this line is the mark of a merge conflict [MA0105]",
                                         "4:1: this line is the mark of a merge conflict [MA0105]",
                                         "6:1: this line is the mark of a merge conflict [MA0105]",
                                         "8:1: this line is the mark of a merge conflict [MA0105]"));
  EXPECT_EQ(TextAt(collector().kept()[2].range), ">>>>>>> 428df34");
}

TEST_F(ReadingTest, ACommandWithAConflictMarkInsideIsPassedOver) {
  EXPECT_THAT(Between("setAttr \".t\" 1\n<<<<<<< HEAD\n2 3\n=======\n4 5\n>>>>>>> x\n;"),
              ElementsAre("3:1: this line is the mark of a merge conflict [MA0105]"));
  EXPECT_FALSE(scene_.Written(At("before"), "t"));
  EXPECT_THAT(Between("someCommand 1\n=======\n2;"), ElementsAre(testing::HasSubstr("MA0105")));
  EXPECT_THAT(Between("connectAttr \"a.b\"\n=======\n\"c.d\";"), ElementsAre(testing::HasSubstr("MA0105")));
}

TEST_F(ReadingTest, ACommandRightAfterTheConflictMarkInACommandWithoutEndIsRead) {
  EXPECT_THAT(Between("someCommand 1\n>>>>>>> x"), ElementsAre(testing::HasSubstr("MA0105")));
  Read("someCommand \"a\"\n>>>>>>>\ncreateNode transform -n \"next\";\n");
  EXPECT_NE(scene_.Find("next"), scene::kNoNode);
}

TEST_F(ReadingTest, WhatOnlyLooksLikeAConflictMarkIsNone) {
  EXPECT_THAT(Between("// x\n//=======\n/* \n======= */"), IsEmpty());
  EXPECT_THAT(Between("========\n;"), ElementsAre("2:1: \"=\" cannot be read here [MA0107]"));
}

TEST_F(ReadingTest, TemplateFieldsAreNamed) {
  EXPECT_THAT(Between("setAttr \".tx\" {{translate_x}};"),
              ElementsAre("2:15: \"{{translate_x}}\" is a template field that nobody filled in [MA0106]"));
  EXPECT_THAT(Between("setAttr \".t\" 1 %TY% 2;"),
              ElementsAre("2:16: \"%TY%\" is a template field that nobody filled in [MA0106]"));
  EXPECT_THAT(Between("setAttr \".tx\" $F;"),
              ElementsAre("2:15: \"$F\" is a template field that nobody filled in [MA0106]"));
  EXPECT_THAT(Between("currentUnit -t ${FPS};"),
              ElementsAre("2:16: \"${FPS}\" is a template field that nobody filled in [MA0106]"));
  EXPECT_THAT(Between("createNode camera -n <NAME>;"),
              ElementsAre(testing::HasSubstr("\"<NAME>\" is a template field")));
  EXPECT_THAT(Between("createNode camera -n @NAME@;"),
              ElementsAre(testing::HasSubstr("\"@NAME@\" is a template field")));
  EXPECT_THAT(Between("{{header}};"), ElementsAre(testing::HasSubstr("\"{{header}}\" is a template field")));
  EXPECT_FALSE(scene_.Written(At("before"), "tx"));
}

TEST_F(ReadingTest, AByteThatMeansNothingIsReportedWhereItStands) {
  EXPECT_THAT(Between("setAttr \".tx\" 5 & 6;"), ElementsAre("2:17: \"&\" cannot be read here [MA0107]"));
  EXPECT_THAT(Between("setAttr \".tx\" \xc3\xbc;"),
              ElementsAre("2:15: \"\xc3\xbc\" cannot be read here [MA0107]"));
  EXPECT_THAT(Between("setAttr \".tx\" \xff;"), ElementsAre("2:15: \"\\xff\" cannot be read here [MA0107]"));
  EXPECT_THAT(Between("connectAttr \"a.b\" %;"), ElementsAre("2:19: \"%\" cannot be read here [MA0107]"));
  EXPECT_THAT(Between("5 5 5;"), ElementsAre("2:1: \"5\" cannot be read here [MA0107]"));
  EXPECT_THAT(Between("\"a\";"), ElementsAre("2:1: \"\"\" cannot be read here [MA0107]"));
  EXPECT_THAT(Between(std::string_view("\0;", 2)),
              ElementsAre("2:1: \"\\x00\" cannot be read here [MA0107]"));
  EXPECT_EQ(scene_.Number(At("before"), "tx"), 0.0);
}

TEST_F(ReadingTest, AStrangeByteInStringsAndCommentsIsNoMatter) {
  EXPECT_THAT(Between("// \xff %x% \x01\n/* {{x}} */ setAttr \".nts\" -type \"string\" \"\xff {{x}} %\";"),
              IsEmpty());
}

TEST_F(ReadingTest, WhatIsPassedOverIsNotLookedAt) {
  EXPECT_THAT(Between("evalDeferred `source x` && $y = 5;"), IsEmpty());
}

TEST_F(ReadingTest, AfterACommandThatCannotBeReadValuesDoNotGoToTheNodeBefore) {
  Read("createNode camera -n \"a\";\ncreateNode camera -n {{name}};\n\tsetAttr \".fl\" 50;\n");
  EXPECT_EQ(scene_.Number(At("a"), "fl"), 35.0);
  EXPECT_EQ(collector().count(), 1u);
}

TEST_F(ReadingTest, EveryCommandThatIsKnownStopsAnOpenOne) {
  for (const char* command :
       {"createNode transform", "setAttr \".tx\" 1", "addAttr -ln \"x\"", "connectAttr \"a.b\" \"c.d\"",
        "disconnectAttr \"a.b\" \"c.d\"", "select -ne \"x\"", "rename \"x\"", "parent \"x\" \"y\"",
        "file -r \"x\"", "fileInfo \"x\" \"y\"", "requires \"x\"", "currentUnit -t film",
        "relationship \"x\"", "lockNode -l 1", "namespace -set \":\"", "applyMetadata \"x\"",
        "dataStructure \"x\""}) {
    Read(std::string("someCommand 1\n \t") + command + ";");
    EXPECT_EQ(collector().CountOf(diag::Code::CommandWithoutEnd), 1u) << command;
  }
}

TEST_F(ReadingTest, NothingIsKeptOfATextThatIsTooLong) {
  static const char byte = '/';
  const std::string_view huge(&byte, std::size_t{0xffffffff});
  diag::Collector collector(std::string_view{});
  const Scene scene = scene::Read(huge, collector);
  EXPECT_TRUE(scene.nodes().empty());
  ASSERT_EQ(collector.kept().size(), 1u);
  EXPECT_EQ(diag::SentenceOf(collector.kept()[0]),
            "the file has 4294967295 bytes, which is more than can be read");
}

}  // namespace
}  // namespace scene

// What stops an import, and where the report says it.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "tests/check/CheckedText.h"

namespace check_test {
namespace {

using check::Stop;
using diag::Code;
using testing::HasSubstr;

TEST(StopsTest, ASceneThatIsTakenHasNoError) {
  const Checked checked(CameraScene("\tsetAttr \".t\" -type \"double3\" 1 2 3 ;\n"));
  EXPECT_EQ(checked.cameOver().stop, Stop::None);
  EXPECT_EQ(checked.All(), "");
}

TEST(StopsTest, AnUnquotedPathIsMarkedWhole) {
  const Checked checked(kHead + "select -ne\n  |rig|shotCam;\n");
  EXPECT_EQ(checked.cameOver().stop, Stop::RefusedByte);
  EXPECT_EQ(checked.MarkedBy(Code::UnquotedPath), "|rig|shotCam");
  EXPECT_EQ(checked.LineOf(Code::UnquotedPath), 4u);
  EXPECT_EQ(checked.report().errors, 1u);
}

TEST(StopsTest, AnAliasListIsMarkedFromBraceToBrace) {
  const Checked checked(
      kHead + "createNode mesh -n \"m\";\n\tsetAttr \".aal\" -type \"attributeAlias\" {\"a\",\"w[0]\"} ;\n");
  EXPECT_EQ(checked.MarkedBy(Code::AliasList), "{\"a\",\"w[0]\"}");
}

TEST(StopsTest, AConflictMarkIsTheWholeLine) {
  for (const char* const mark : {"<<<<<<< HEAD", "=======", ">>>>>>> theirs", "||||||| base"}) {
    const Checked checked(kHead + mark + "\ncreateNode transform -n \"a\";\n");
    EXPECT_EQ(checked.MarkedBy(Code::ConflictMarkStops), mark);
    EXPECT_EQ(checked.LineOf(Code::ConflictMarkStops), 3u);
  }
}

TEST(StopsTest, ATemplateFieldIsNamed) {
  for (const char* const field : {"{{FPS}}", "${FPS}", "@FPS@", "%FPS%", "<FPS>"}) {
    const Checked checked("//Maya ASCII 2018 scene\ncurrentUnit -t " + std::string(field) + ";\n");
    EXPECT_EQ(checked.MarkedBy(Code::TemplateFieldStops), field);
  }
}

TEST(StopsTest, AnyOtherByteIsShownAsItIs) {
  EXPECT_EQ(Checked(kHead + "createNode transform -n _root;\n").MarkedBy(Code::RefusedByte), "_");
  EXPECT_EQ(Checked(kHead + "setAttr { 1 };\n").MarkedBy(Code::RefusedByte), "{");
  EXPECT_EQ(Checked(kHead + "/ 3;\n").MarkedBy(Code::RefusedByte), "/");
  EXPECT_EQ(Checked(kHead + "a \xe2\x82\xac;\n").MarkedBy(Code::RefusedByte), "\xe2\x82\xac");
  EXPECT_THAT(Checked(kHead + "a \xff;\n").SentenceOf(Code::RefusedByte), HasSubstr("\\xff"));
  EXPECT_EQ(Checked(kHead + "a \x81\x82\x83;\n").MarkedBy(Code::RefusedByte), "\x81");
  EXPECT_EQ(Checked(kHead + "a \xe2\x82;\n").MarkedBy(Code::RefusedByte), "\xe2");
}

TEST(StopsTest, EveryByteIsRefusedWhereTheImportRefusesIt) {
  for (int byte = 1; byte < 256; ++byte) {
    const Checked checked(kHead + "a \n" + static_cast<char>(byte) + "x y;\n");
    const bool refused = checked.cameOver().stop == Stop::RefusedByte;
    EXPECT_EQ(checked.report().errors, checked.cameOver().stop == Stop::None ? 0u : 1u) << byte;
    EXPECT_EQ(checked.CountOf(Code::ImportStopped), 0u) << byte;
    if (!refused) continue;
    EXPECT_EQ(checked.report().findings[0].diagnostic.place.line, checked.cameOver().line) << byte;
  }
}

TEST(StopsTest, ALastCommentWithoutALineEnd) {
  const Checked checked(kHead + "// End of shot.ma");
  EXPECT_EQ(checked.MarkedBy(Code::LastCommentOpen), "// End of shot.ma");
}

TEST(StopsTest, AFileThatIsCutOffShowsWhereWhatItWasCutInBegan) {
  EXPECT_EQ(Checked(kHead + "fileInfo \"a\" \"b\nc\n").MarkedBy(Code::CutOffInString), "\"b");
  EXPECT_EQ(Checked(kHead + "/* a\nb\n").LineOf(Code::CutOffInComment), 3u);
  EXPECT_EQ(Checked(kHead + "createNode transform\n -n \"a\"\n").MarkedBy(Code::CutOffInCommand),
            "createNode");
  EXPECT_EQ(Checked(kHead + "createNode transform -n \"a\";\nsetAtt").MarkedBy(Code::CutOffInCommand),
            "setAtt");
}

TEST(StopsTest, ANumberIsMarkedAlone) {
  EXPECT_EQ(
      Checked(CameraScene("\tsetAttr \".t\" -type \"double3\" 1 1e999 3 ;\n")).MarkedBy(Code::NumberTooLarge),
      "1e999");
  EXPECT_EQ(Checked(CameraScene("\tsetAttr \".t\" -type \"double3\" 1 1.#QNAN 3 ;\n"))
                .MarkedBy(Code::NumberUnreadable),
            "1.#QNAN");
}

TEST(StopsTest, UnequalKeyCountsNameTheNodeTheCurvesAndTheirKeys) {
  const Checked checked(CameraScene("", "",
                                    CurveOf("moveX", "1 0 2 5 3 9", "shotCam.tx") +
                                        CurveOf("turnY", "1 0 3 90", "shotCam.ry", "animCurveTA")));
  EXPECT_EQ(checked.cameOver().stop, Stop::UnequalKeys);
  EXPECT_EQ(
      checked.SentenceOf(Code::UnequalKeys),
      "the import stops at \"shotCam\": 3 keys on translateX (\"moveX\"), but 2 on rotateY (\"turnY\")");
  EXPECT_EQ(checked.MarkedBy(Code::UnequalKeys), "1 0 3 90");
}

TEST(StopsTest, AllOddCurvesOfTheNodeStandInOneDiagnostic) {
  const Checked checked(CameraScene("", "",
                                    CurveOf("moveX", "1 0 2 5 3 9", "shotCam.tx") +
                                        CurveOf("turnY", "1 0 3 90", "shotCam.ry", "animCurveTA") +
                                        CurveOf("growZ", "1 1 3 2 5 6 7 4", "shotCam.sz", "animCurveTU") +
                                        CurveOf("moveY", "1 7 2 8 4 6", "shotCam.ty")));
  EXPECT_EQ(checked.SentenceOf(Code::UnequalKeys),
            "the import stops at \"shotCam\": 3 keys on translateX (\"moveX\"), but 2 on rotateY "
            "(\"turnY\"), 4 on scaleZ (\"growZ\")");
  EXPECT_EQ(checked.report().errors, 1u);
}

TEST(StopsTest, UnequalKeyCountsAreFoundAmongCurvesOfOneName) {
  const std::string twins = "createNode transform -n \"shotCam\";\n" +
                            CurveOf("turnY", "1 0 3 90 7 2 8 4", "shotCam.ry", "animCurveTA");
  const Checked checked(CameraScene("", "", CurveOf("moveX", "1 0 2 5 3 9", "shotCam.tx") + twins));
  EXPECT_EQ(checked.cameOver().stop, Stop::UnequalKeys);
  EXPECT_EQ(checked.MarkedBy(Code::UnequalKeys), "1 0 3 90 7 2 8 4");
  EXPECT_EQ(checked.CountOf(Code::ImportStopped), 0u);
}

TEST(StopsTest, WhatTheHostRefusesIsSaidWithItsSentence) {
  const Checked checked(CameraScene("", "\tsetAttr \".cap\" -type \"double2\" 0 0 ;\n"));
  EXPECT_EQ(checked.cameOver().stop, Stop::Other);
  EXPECT_THAT(checked.SentenceOf(Code::ImportStopped), HasSubstr("film size"));
}

TEST(StopsTest, AFileThatIsNoSceneIsSaidByItsKind) {
  using namespace std::string_literals;
  EXPECT_EQ(Checked("FOR8\0\0\0\0"s).CountOf(Code::MayaBinary), 1u);
  EXPECT_EQ(Checked("FOR4abcd").CountOf(Code::MayaBinary), 1u);
  EXPECT_THAT(Checked("\x1f\x8b\x08"s).SentenceOf(Code::CompressedFile), HasSubstr("gzip"));
  EXPECT_THAT(Checked("PK\x03\x04"s).SentenceOf(Code::CompressedFile), HasSubstr("zip"));
  EXPECT_EQ(Checked("").CountOf(Code::EmptyFile), 1u);
  EXPECT_EQ(Checked(" \n\0\0"s).CountOf(Code::EmptyFile), 1u);
  EXPECT_EQ(Checked("\xef\xbb\xbf//Maya ASCII 2018 scene\n").CountOf(Code::MarkBeforeHeader), 1u);
  EXPECT_EQ(Checked("#usda 1.0\n").CountOf(Code::NotMayaAscii), 1u);
  EXPECT_FALSE(Checked("#usda 1.0\n").report().head.isScene);
}

// The import says the line, too: both count it as an editor does.
TEST(StopsTest, TheLineOfAStopIsTheImportsWhateverEndsLines) {
  const std::string head = CameraScene("");
  const std::string stops[] = {"createNode transform -n _root;\n",
                               "setAttr \".t\" -type \"double3\" 1e999 0 0 ;\n",
                               "createNode transform\n -n \"open\n"};
  const Code codes[] = {Code::RefusedByte, Code::NumberTooLarge, Code::CutOffInString};
  const std::vector<std::vector<std::string>> allEnds = {
      {"\n"}, {"\r\n"}, {"\r"}, {"\r", "\r\n", "\n"}, {"\n", "\r", "\r"}};
  for (std::size_t stop = 0; stop < std::size(stops); ++stop) {
    const std::string text = head + "createNode transform -n \"last\";\n" + stops[stop];
    std::string line;
    for (const std::vector<std::string>& ends : allEnds) {
      std::string changed;
      std::size_t count = 0;
      for (const char c : text) changed += c == '\n' ? ends[count++ % ends.size()] : std::string(1, c);
      const Checked checked(changed);
      const check::Finding& finding = checked.Only(codes[stop]);
      EXPECT_EQ(finding.diagnostic.place.line, checked.cameOver().line) << stop;
      if (line.empty()) line = std::to_string(finding.diagnostic.place.line) + finding.excerpt;
      EXPECT_EQ(std::to_string(finding.diagnostic.place.line) + finding.excerpt, line) << stop;
    }
  }
}

TEST(StopsTest, TheSameStopIsNotSaidTwice) {
  const Checked checked(kHead + "createNode transform -n \"a\n");
  EXPECT_EQ(checked.CountOf(Code::OpenString), 0u);
  EXPECT_EQ(checked.report().errors, 1u);
}

}  // namespace
}  // namespace check_test

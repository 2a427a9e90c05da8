// The last line of an import: what did not come over, and the command that brings it.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <string>
#include <utility>

#include "tests/tools/ToolRun.h"

namespace mayascene_test {
namespace {

using testing::EndsWith;
using testing::HasSubstr;

constexpr const char* kBring = "To bring it over: ";

std::string cameraScene(const std::string& rest) {
  return sceneText("createNode transform -n \"cam\";\ncreateNode camera -n \"camShape\" -p \"cam\";\n" +
                   rest);
}

std::string curvedScene() {
  return cameraScene(
      "createNode animCurveTL -n \"c\";\n\tsetAttr \".tan\" 3;\n\tsetAttr \".wgt\" no;\n"
      "\tsetAttr -s 2 \".ktv[0:1]\" 1 0 11 10;\nconnectAttr \"c.o\" \"cam.tx\";\n");
}

std::string pathScene() { return cameraScene("file -rdi 1 -rfn \"aRN\"\n\t2 |rig|head \"v\" \"0\";\n"); }

class ClosingLine : public ToolTest {
 protected:
  ClosingLine() {
    write("whole.ma", cameraScene(""));
    write("curved.ma", curvedScene());
    write("path.ma", pathScene());
  }

  // How often a run says a command at its end.
  static std::size_t lines(const ToolResult& result) {
    std::size_t count = 0;
    for (std::size_t at = result.err.find(kBring); at != std::string::npos;
         at = result.err.find(kBring, at + 1)) {
      ++count;
    }
    return count;
  }
};

TEST_F(ClosingLine, NamesTheLossItsLineAndTheCommand) {
  const ToolResult result = run({"import", "curved.ma"});
  EXPECT_EQ(result.status, 0);
  EXPECT_THAT(
      result.err,
      EndsWith("mayascene: curved.ma: line 9: the path between the keys of \"cam\" on translateX does not "
               "come over. To bring it over: mayascene import --bake curved.ma\n"));
  EXPECT_EQ(lines(result), 1u);
}

TEST_F(ClosingLine, IsNotThereWhereAllCameOver) { EXPECT_EQ(lines(run({"import", "whole.ma"})), 0u); }

TEST_F(ClosingLine, AQuietImportSaysItOnlyWhereItStopped) {
  EXPECT_EQ(lines(run({"import", "--quiet", "curved.ma"})), 0u);
  const ToolResult stopped = run({"import", "--quiet", "path.ma"});
  EXPECT_EQ(stopped.status, 1);
  EXPECT_THAT(stopped.err,
              EndsWith("mayascene: path.ma: line 10: a path without quotes, as edits of references have "
                       "them, ends the import. To bring it over: mayascene import --bake path.ma\n"));
}

TEST_F(ClosingLine, TheCommandBringsItOverAndThenNothingIsSaid) {
  for (const char* scene : {"curved.ma", "path.ma"}) {
    EXPECT_EQ(run({"import", "--bake", "--quiet", scene}).status, 0) << scene;
    EXPECT_EQ(lines(run({"import", "--bake", scene})), 0u) << scene;
    EXPECT_EQ(run({"bake", "--quiet", scene, "-o", "baked.ma"}).status, 0) << scene;
    const ToolResult again = run({"import", "baked.ma"});
    EXPECT_EQ(again.status, 0) << scene;
    EXPECT_EQ(lines(again), 0u) << again.err;
  }
}

// Pasted as it stands, the command writes what the export did not.
TEST_F(ClosingLine, AnExportNamesItselfAndTheShellRunsIt) {
  const std::string folder = std::filesystem::path(MAYASCENE_TOOL).parent_path();
  for (const auto& [file, word] :
       {std::pair<std::string, std::string>("out.x", "out.x"), {"a b.x", "'a b.x'"}}) {
    const ToolResult result =
        run({"export", "curved.ma", "-f", "csv", "--frames", "-2:9", "--scale", "2", "-o", file});
    EXPECT_EQ(result.status, 0);
    ASSERT_EQ(lines(result), 1u) << result.err;
    const std::string command = result.err.substr(result.err.rfind(kBring) + std::string(kBring).size());
    EXPECT_EQ(command, "mayascene export --bake -f csv --frames=-2:9 --scale 2 curved.ma -o " + word + '\n');
    const std::string plain = read(file);
    write("script", command);
    const std::string shell =
        "cd '" + path("").string() + "' && PATH='" + folder + "':\"$PATH\" bash script 2>said";
    EXPECT_EQ(std::system(shell.c_str()), 0) << read("said");
    EXPECT_NE(read(file), plain);
    EXPECT_EQ(read("said").find(kBring), std::string::npos);
  }
  EXPECT_THAT(run({"export", "curved.ma", "path.ma", "-f", "glb", "-o", "all"}).err,
              EndsWith("mayascene export --bake -f glb path.ma -o all/path.glb\n"));
  EXPECT_THAT(run({"export", "curved.ma", "-f", "csv", "-o", "-"}).err,
              EndsWith("mayascene export --bake -f csv curved.ma -o -\n"));
  EXPECT_THAT(run({"export", "-q", "path.ma", "-o", "x.glb"}).err, EndsWith(" path.ma -o x.glb\n"));
  EXPECT_EQ(lines(run({"export", "-q", "curved.ma", "-o", "x.glb"})), 0u);
}

TEST_F(ClosingLine, AStrictExportEndsWithOneWhereItIsSaid) {
  EXPECT_EQ(run({"export", "--strict", "whole.ma", "-o", "x.csv"}).status, 0);
  for (const bool quiet : {false, true}) {
    const ToolResult result =
        run({"export", "--strict", "curved.ma", "-o", "x.csv", quiet ? "-q" : "--keys"});
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(lines(result), 1u);  // --quiet does not hide the reason of the status
  }
  EXPECT_EQ(run({"export", "--strict", "--bake", "curved.ma", "-o", "x.csv"}).status, 0);
  EXPECT_EQ(run({"export", "curved.ma", "-o", "x.csv"}).status, 0);
}

TEST_F(ClosingLine, EachSceneHasItsOwnAfterAllOfThem) {
  const ToolResult result = run({"import", "curved.ma", "whole.ma", "path.ma", "missing.ma"});
  EXPECT_EQ(result.status, 3);
  EXPECT_EQ(lines(result), 2u);
  EXPECT_THAT(result.err, EndsWith("--bake path.ma\n"));
  EXPECT_LT(result.err.find("missing.ma: cannot be opened"), result.err.find("--bake curved.ma"));
}

TEST_F(ClosingLine, StatusAndStandardOutputStayAsTheyAre) {
  const ToolResult loud = run({"import", "--json", "-", "curved.ma"});
  const ToolResult quiet = run({"import", "--json", "-", "--quiet", "curved.ma"});
  EXPECT_EQ(loud.status, quiet.status);
  EXPECT_EQ(loud.out, quiet.out);
}

TEST_F(ClosingLine, IsNotThereWhereTheSceneIsNotWhatStopped) {
  write("notes.txt", "hello, these are notes\n");
  EXPECT_EQ(lines(run({"import", "notes.txt"})), 0u);
  EXPECT_EQ(lines(run({"import", "--fail", "NewCameraLayer:1=1289985", "curved.ma"})), 0u);
  EXPECT_EQ(lines(run({"import", "--fail", "CreateComp:1=77", "curved.ma"})), 0u);
  write("short.ma", "//Maya\n");
  EXPECT_EQ(lines(run({"import", "short.ma"})), 0u);
}

TEST_F(ClosingLine, NamesTheCameraWhoseKeysStopTheImport) {
  write("unequal.ma", curvedScene() +
                          "createNode animCurveTL -n \"d\";\n\tsetAttr \".ktv[0:2]\" 1 0 2 3 11 10;\n"
                          "connectAttr \"d.o\" \"cam.ty\";\n");
  const ToolResult result = run({"import", "-q", "unequal.ma"});
  EXPECT_EQ(result.status, 1);
  EXPECT_THAT(result.err,
              HasSubstr("unequal.ma: line 15: \"cam\" has 2 keys on translateX and 3 keys on translateY: "
                        "different numbers of keys end the import. To bring it over: "));
}

TEST_F(ClosingLine, LocatorsWithoutACameraHaveNoCommandBecauseNoneBringsThemOver) {
  write("points.ma",
        sceneText("createNode transform -n \"p\";\ncreateNode locator -n \"pShape\" -p \"p\";\n"));
  const ToolResult result = run({"import", "points.ma"});
  EXPECT_THAT(result.err, EndsWith("the locator \"pShape\" has no \"null\" in its name\n"));
  EXPECT_THAT(run({"import", "--bake", "--locators", "all", "points.ma"}).out,
              HasSubstr("nothing to import, the scene has no cameras"));
}

// A user can copy the command from the terminal: the shell restores the name byte by byte.
TEST_F(ClosingLine, TheNameInTheCommandIsEscapedAndTheShellRestoresItsBytes) {
  for (const std::string name :
       {"a b.ma", "it's.ma", "$(touch x).ma", "\x1b[31mred.ma", "new\nline.ma", "\xff\xfe.ma",
        "caf\xc3\xa9.ma", "back\\slash.ma", "-q.ma", "\xe2\x80\xae.ma", "~.ma", "a;b.ma", "*.ma"}) {
    write(name, pathScene());
    const ToolResult result = run({"import", "-q", "--", name});
    ASSERT_EQ(lines(result), 1u) << result.err;
    const std::string start = "mayascene import --bake ";
    const std::string word = result.err.substr(result.err.rfind(start) + start.size());
    EXPECT_EQ(word.find_first_of("\x1b\xff\r"), std::string::npos) << word;
    EXPECT_EQ(word.find('\n'), word.size() - 1) << word;
    write("script", "test -f " + word.substr(0, word.size() - 1) + "\n");
    const std::string shell = "cd '" + path("").string() + "' && bash script";
    EXPECT_EQ(std::system(shell.c_str()), 0) << word;
    EXPECT_FALSE(std::filesystem::exists(path("x")));
  }
}

}  // namespace
}  // namespace mayascene_test

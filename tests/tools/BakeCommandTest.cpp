// mayascene bake and import --bake, as a user runs them.
#include <fcntl.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <signal.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <filesystem>
#include <string>
#include <vector>

#include "tests/tools/ToolRun.h"

namespace mayascene_test {
namespace {

using testing::AllOf;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

// Two keys, which the importer alone would take as they are; an unquoted path, which it refuses.
std::string unbakedScene() {
  return sceneText(
      "createNode transform -n \"shotcam\";\n\tsetAttr \".ro\" 2;\n"
      "createNode camera -n \"shotcamShape\" -p \"shotcam\";\n"
      "createNode animCurveTL -n \"c\";\n\tsetAttr \".tan\" 2;\n\tsetAttr \".wgt\" no;\n"
      "\tsetAttr -s 2 \".ktv[0:1]\" 1001 0 1011 10;\nconnectAttr \"c.o\" \"shotcam.tx\";\n"
      "select -ne |shotcam;\n");
}

class BakeCommand : public ToolTest {
 protected:
  BakeCommand() {
    std::filesystem::create_directory(path("tmp"));
    environment["TMPDIR"] = path("tmp").string();
  }
  bool temporariesAreGone() const { return std::filesystem::is_empty(path("tmp")); }
};

TEST_F(BakeCommand, WritesASceneThatTheImporterTakes) {
  write("shot.ma", unbakedScene());
  EXPECT_EQ(run({"import", "--quiet", "shot.ma"}).status, 1);
  const ToolResult bake = run({"bake", "shot.ma", "-o", "baked.ma"});
  EXPECT_EQ(bake.status, 0) << bake.err;
  EXPECT_THAT(bake.err, HasSubstr("|shotcam|shotcamShape: baked over frames 1001 to 1011"));
  const ToolResult imported = run({"import", "baked.ma"});
  EXPECT_EQ(imported.status, 0) << imported.err;
  EXPECT_THAT(imported.out, HasSubstr("position animated, frames 0 to 10\n"));
}

TEST_F(BakeCommand, NamesTheSceneAndTheOptionsInItsFirstComment) {
  write("shot.ma", unbakedScene());
  run({"bake", "shot.ma", "--frames", "1001:1003", "--world", "-o", "baked.ma"});
  EXPECT_THAT(read("baked.ma"), HasSubstr(" from shot.ma with --frames 1001:1003 --world\n"));
}

TEST_F(BakeCommand, ImportsABakeUnderTheScenesOwnNameAndRemovesIt) {
  write("shot.ma", unbakedScene());
  const ToolResult imported = run({"import", "--bake", "shot.ma"});
  EXPECT_EQ(imported.status, 0) << imported.err;
  EXPECT_THAT(imported.out, HasSubstr("shot.ma"));
  EXPECT_THAT(imported.out + imported.err, Not(HasSubstr(path("tmp").string())));
  EXPECT_TRUE(temporariesAreGone());
}

TEST_F(BakeCommand, TheTraceHasThePathThatWasPassed) {
  write("shot.ma", unbakedScene());
  run({"import", "--bake", "--quiet", "--trace", "trace", "shot.ma"});
  EXPECT_THAT(read("trace"), HasSubstr(path("tmp").string()));
  EXPECT_THAT(read("trace"), HasSubstr("\"name\":\"shot\""));
}

TEST_F(BakeCommand, ASignalRemovesTheTemporaryBake) {
  write("shot.ma", unbakedScene());
  for (const int signal : {SIGINT, SIGTERM, SIGHUP}) {
    // Long enough that the signal comes while the bake is there.
    const int process = start({"import", "--bake", "--quiet", "--frames", "1:1999999", "shot.ma"});
    for (int i = 0; i < 3'000 && temporariesAreGone(); ++i) usleep(10'000);
    ASSERT_FALSE(temporariesAreGone());
    ASSERT_EQ(kill(process, signal), 0);
    EXPECT_EQ(end(process).status, 128 + signal);
    EXPECT_TRUE(temporariesAreGone()) << signal;
  }
}

TEST_F(BakeCommand, ASignalLeavesNoBakeThatIsNotWhole) {
  write("shot.ma", unbakedScene());
  for (const int signal : {SIGINT, SIGTERM, SIGHUP}) {
    const std::vector<std::string> before = files();
    const int process = start({"bake", "--quiet", "--frames", "1:1999999", "shot.ma", "-o", "baked.ma"});
    for (int i = 0; i < 3'000 && files() == before; ++i) usleep(10'000);
    ASSERT_NE(files(), before);
    ASSERT_EQ(kill(process, signal), 0);
    EXPECT_EQ(end(process).status, 128 + signal);
    EXPECT_EQ(files(), before) << signal;
  }
}

// The import of the bake waits for the reader of its trace: the folder is there to look at meanwhile.
TEST_F(BakeCommand, OnlyTheUserCanEnterTheTemporaryFolder) {
  namespace fs = std::filesystem;
  write("shot.ma", unbakedScene());
  ASSERT_EQ(mkfifo(path("trace").c_str(), 0600), 0);
  const int process =
      start({"import", "--bake", "--quiet", "--frames", "1:2000", "--trace", "trace", "shot.ma"});
  const int trace = open(path("trace").c_str(), O_RDONLY | O_CLOEXEC);
  ASSERT_GE(trace, 0);
  const auto bakeIsThere = [&] {
    const fs::recursive_directory_iterator all(path("tmp"));
    return std::any_of(fs::begin(all), fs::end(all), [](const auto& one) { return one.is_regular_file(); });
  };
  for (int i = 0; i < 3'000 && !bakeIsThere(); ++i) usleep(1'000);
  int seen = 0;
  for (const auto& folder : fs::directory_iterator(path("tmp"))) {
    EXPECT_EQ(folder.status().permissions(), fs::perms::owner_all);
    for (const auto& file : fs::directory_iterator(folder)) {
      EXPECT_EQ(file.path().filename(), "shot.ma");
      ++seen;
      EXPECT_EQ(file.status().permissions(), fs::perms::owner_read | fs::perms::owner_write);
    }
  }
  EXPECT_EQ(seen, 1);
  char text[4096];
  while (::read(trace, text, sizeof text) > 0) {
  }
  close(trace);
  EXPECT_EQ(end(process).status, 0);
  EXPECT_TRUE(temporariesAreGone());
}

TEST_F(BakeCommand, WhatIsShownNamesTheSceneAlsoWhereItIsHostile) {
  for (const std::string name : {"dir/shot.ma", "dir/a\x1b[2Jb.ma", "dir/\xff.ma", "dir/new\nline.ma"}) {
    std::filesystem::create_directories(path("dir"));
    write(name, unbakedScene());
    const ToolResult result =
        run({"import", "-v", "--bake", "--json", "out.json", "--report", "r.json", name});
    EXPECT_EQ(result.status, 0) << result.err;
    EXPECT_THAT(result.err, HasSubstr("kept by design: file dir/"));
    const std::string all = result.out + result.err + read("out.json") + read("r.json");
    EXPECT_THAT(all, Not(HasSubstr(path("tmp").string()))) << name;
    EXPECT_EQ(all.find('\x1b'), std::string::npos);
  }
}

TEST_F(BakeCommand, ATemporaryFolderThatCannotBeMadeIsStatus5) {
  write("shot.ma", unbakedScene());
  environment["TMPDIR"] = path("missing").string();
  const ToolResult result = run({"import", "--bake", "--json", "out.json", "shot.ma"});
  EXPECT_EQ(result.status, 5);
  EXPECT_THAT(result.err, HasSubstr("mayascene: shot.ma: a temporary folder cannot be written"));
}

TEST_F(BakeCommand, SeveralScenesGoIntoAFolderAndNamesThatAreTheSameAreNumbered) {
  std::filesystem::create_directories(path("a"));
  std::filesystem::create_directories(path("b"));
  write("a/shot.ma", unbakedScene());
  write("b/SHOT.ma", unbakedScene());
  EXPECT_EQ(run({"bake", "-q", "a/shot.ma", "b/SHOT.ma", "-o", "out"}).status, 0);
  EXPECT_TRUE(std::filesystem::exists(path("out/shot.ma")));
  EXPECT_TRUE(std::filesystem::exists(path("out/SHOT_2.ma")));
}

TEST_F(BakeCommand, ASceneIsNeverOverwritten) {
  const std::string scene = unbakedScene();
  write("shot.ma", scene);
  EXPECT_EQ(run({"bake", "shot.ma", "-o", "shot.ma"}).status, 2);
  EXPECT_EQ(run({"bake", "shot.ma", "-o", "./x/../shot.ma"}).status, 2);
  EXPECT_EQ(run({"bake", "shot.ma", "-o", "."}).status, 2);
  EXPECT_EQ(run({"bake", "shot.ma", "-o", "baked.ma", "--report", "shot.ma"}).status, 2);
  EXPECT_EQ(read("shot.ma"), scene);
}

TEST_F(BakeCommand, ASceneIsNotOverwrittenThroughALinkEither) {
  namespace fs = std::filesystem;
  const std::string scene = unbakedScene();
  write("shot.ma", scene);
  fs::create_directory(path("out"));
  fs::create_symlink(path("shot.ma"), path("soft.ma"));
  fs::create_symlink("../shot.ma", path("out/shot.ma"));
  fs::create_hard_link(path("shot.ma"), path("hard.ma"));
  fs::create_directory_symlink(".", path("here"));
  const std::string whole = path("shot.ma").string();
  for (const std::string output : {"soft.ma", "hard.ma", "here/shot.ma", "here/./here/soft.ma", "out", "out/",
                                   "here", ".//shot.ma", whole.c_str()}) {
    const ToolResult result = run({"bake", "shot.ma", "-o", output});
    EXPECT_EQ(result.status, 2) << output;
    EXPECT_THAT(result.err, HasSubstr("would be overwritten")) << output;
    EXPECT_EQ(run({"import", "--bake", "--report", output, "shot.ma"}).status == 0, false) << output;
  }
  EXPECT_EQ(read("shot.ma"), scene);
}

TEST_F(BakeCommand, TheReportIsNotOneOfTheBakes) {
  write("shot.ma", unbakedScene());
  EXPECT_EQ(run({"bake", "shot.ma", "-o", "baked.ma", "--report", "./baked.ma"}).status, 2);
  EXPECT_EQ(run({"bake", "shot.ma", "-o", "out/", "--report", "out/shot.ma"}).status, 2);
}

TEST_F(BakeCommand, SeveralScenesNeedAFolder) {
  write("a.ma", unbakedScene());
  write("b.ma", unbakedScene());
  write("file", "");
  EXPECT_EQ(run({"bake", "a.ma", "b.ma", "-o", "-"}).status, 2);
  const ToolResult result = run({"bake", "a.ma", "b.ma", "-o", "file"});
  EXPECT_EQ(result.status, 2);
  EXPECT_THAT(result.err, HasSubstr("file is not a folder: the outputs of several scenes need one"));
  EXPECT_FALSE(std::filesystem::exists(path("-")));
}

TEST_F(BakeCommand, AFolderIsMadeAlsoForOneScene) {
  write("a.ma", unbakedScene());
  EXPECT_EQ(run({"bake", "-q", "a.ma", "-o", "new/deep/"}).status, 0);
  EXPECT_TRUE(std::filesystem::exists(path("new/deep/a.ma")));
}

TEST_F(BakeCommand, ASceneThatFailsLeavesWhatLiesAtItsPlace) {
  write("notes.ma", "hello\n");
  write("baked.ma", "before");
  EXPECT_EQ(run({"bake", "-q", "notes.ma", "-o", "baked.ma"}).status, 1);
  EXPECT_EQ(run({"bake", "-q", "missing.ma", "-o", "baked.ma"}).status, 3);
  write("shot.ma", unbakedScene());
  EXPECT_EQ(run({"bake", "-q", "--camera", "nobody", "shot.ma", "-o", "baked.ma"}).status, 1);
  EXPECT_EQ(read("baked.ma"), "before");
}

TEST_F(BakeCommand, TheSameInputGivesTheSameBytes) {
  write("shot.ma", unbakedScene());
  for (const char* output : {"one.ma", "two.ma"}) {
    EXPECT_EQ(run({"bake", "-q", "--step", "0.25", "shot.ma", "-o", output}).status, 0);
  }
  EXPECT_EQ(read("one.ma"), read("two.ma"));
  environment["TZ"] = "Asia/Tokyo";
  environment["LC_ALL"] = "de_DE.UTF-8";
  EXPECT_EQ(run({"bake", "-q", "--step", "0.25", "shot.ma", "-o", "three.ma"}).status, 0);
  EXPECT_EQ(read("one.ma"), read("three.ma"));
}

TEST_F(BakeCommand, FramesAndAStepOfAFractionOfAFrameAreWhatIsWritten) {
  write("shot.ma", unbakedScene());
  EXPECT_EQ(run({"bake", "-q", "--frames", "1001:1002", "--step", "0.25", "shot.ma", "-o", "b.ma"}).status,
            0);
  EXPECT_THAT(read("b.ma"), AllOf(HasSubstr("-s 5 \".ktv[0:4]\"  0 0 0.25 0.2"), HasSubstr(" 0.75 0.7")));
  EXPECT_THAT(read("b.ma"),
              HasSubstr("// Frame 0 is frame 1001 of that scene; its last one, 1, is frame 1002."));
  EXPECT_EQ(run({"bake", "-q", "--frames", "1005", "shot.ma", "-o", "b.ma"}).status, 0);
  EXPECT_THAT(read("b.ma"), Not(HasSubstr("animCurve")));
  EXPECT_THAT(read("b.ma"), HasSubstr("setAttr \".t\" -type \"double3\" 3.99999"));
  EXPECT_EQ(run({"bake", "-q", "--frames=-3:-1.5", "--step=.5", "shot.ma", "-o", "b.ma"}).status, 0);
  EXPECT_THAT(read("b.ma"),
              HasSubstr("// Frame 0 is frame -3 of that scene; its last one, 1.5, is frame -1.5."));
}

TEST_F(BakeCommand, OneOfSeveralNamesThatIsNotThereIsStatus1AndTheOthersAreWritten) {
  write("shot.ma", unbakedScene());
  const ToolResult result =
      run({"bake", "--camera", "shotcam", "--camera", "nobody", "shot.ma", "-o", "baked.ma"});
  EXPECT_EQ(result.status, 1);
  EXPECT_THAT(read("baked.ma"), HasSubstr("createNode camera -n \"shotcamShape\""));
  for (const char* name : {"shotcam", "shotcamShape", "|shotcam", "|shotcam|shotcamShape"}) {
    EXPECT_EQ(run({"bake", "-q", "--camera", name, "shot.ma", "-o", "one.ma"}).status, 0) << name;
  }
  for (const char* name : {"SHOTCAM", "shot", "shotcam|shotcamShape|", "cam"}) {
    EXPECT_EQ(run({"bake", "-q", "--camera", name, "shot.ma", "-o", "one.ma"}).status, 1) << name;
  }
}

TEST_F(BakeCommand, ACameraThatIsNotThereIsStatus1AndNothingIsWritten) {
  write("shot.ma", unbakedScene());
  const ToolResult result = run({"bake", "--camera", "ShotCam", "shot.ma", "-o", "baked.ma"});
  EXPECT_EQ(result.status, 1);
  EXPECT_THAT(result.err, HasSubstr("no camera is called \"ShotCam\" [MA0501]"));
  EXPECT_FALSE(std::filesystem::exists(path("baked.ma")));
  EXPECT_EQ(run({"import", "--bake", "-q", "--camera", "ShotCam", "shot.ma"}).status, 1);
}

TEST_F(BakeCommand, WarningsAreStatus1WithStrictAlone) {
  write("shot.ma", sceneText("createNode transform -n \"a\";\ncreateNode camera -n \"aShape\" -p \"a\";\n"
                             "\tsetAttr \".fio\" -type \"double2\" 0.1 0 ;\n"));
  const ToolResult lenient = run({"bake", "shot.ma", "-o", "baked.ma"});
  EXPECT_EQ(lenient.status, 0);
  EXPECT_THAT(lenient.err, HasSubstr("shot.ma:8:23: warning: the film offset of \"|a|aShape\" is lost"));
  EXPECT_THAT(lenient.err, HasSubstr("help: "));
  EXPECT_EQ(run({"bake", "--strict", "shot.ma", "-o", "baked.ma"}).status, 1);
  EXPECT_TRUE(std::filesystem::exists(path("baked.ma")));
  EXPECT_EQ(run({"import", "--bake", "--strict", "-q", "shot.ma"}).status, 1);
}

TEST_F(BakeCommand, OptionsOfABakeAreWrongUsageWithoutOne) {
  write("shot.ma", unbakedScene());
  for (const char* option : {"--world", "--strict", "--frames=1:2", "--step=1", "--camera=a",
                             "--locators=all", "--report=r.json"}) {
    const ToolResult result = run({"import", option, "shot.ma"});
    EXPECT_EQ(result.status, 2) << option;
    EXPECT_THAT(result.err, HasSubstr("needs --bake")) << option;
  }
}

TEST_F(BakeCommand, WordsThatMeanNothingAreWrongUsage) {
  write("shot.ma", unbakedScene());
  for (const char* option : {"--frames=2:1", "--frames=a:b", "--frames=1:", "--frames=nan:2", "--step=0",
                             "--step=-1", "--step=x", "--locators=some"}) {
    EXPECT_EQ(run({"bake", option, "shot.ma", "-o", "baked.ma"}).status, 2) << option;
  }
  EXPECT_EQ(run({"bake", "shot.ma"}).status, 2);
}

TEST_F(BakeCommand, AFileThatIsNoSceneIsRefused) {
  write("shot.ma", "hello\n");
  const ToolResult result = run({"bake", "shot.ma", "-o", "baked.ma"});
  EXPECT_EQ(result.status, 1);
  EXPECT_THAT(result.err, HasSubstr("refused: it is not a Maya ASCII scene"));
  EXPECT_FALSE(std::filesystem::exists(path("baked.ma")));
  EXPECT_EQ(run({"import", "--bake", "shot.ma"}).status, 1);
}

TEST_F(BakeCommand, AFileThatCannotBeReadIsStatus3AndTheOthersAreBaked) {
  write("shot.ma", unbakedScene());
  EXPECT_EQ(run({"bake", "-q", "missing.ma", "shot.ma", "-o", "out"}).status, 3);
  EXPECT_TRUE(std::filesystem::exists(path("out/shot.ma")));
  EXPECT_FALSE(std::filesystem::exists(path("out/missing.ma")));
}

TEST_F(BakeCommand, AnOutputThatCannotBeWrittenIsStatus5) {
  write("shot.ma", unbakedScene());
  EXPECT_EQ(run({"bake", "-q", "shot.ma", "-o", "missing/baked.ma"}).status, 5);
  EXPECT_EQ(run({"bake", "-q", "shot.ma", "-o", "baked.ma", "--report", "missing/r.json"}).status, 5);
}

TEST_F(BakeCommand, TheBakeCanGoToStandardOutput) {
  write("shot.ma", unbakedScene());
  const ToolResult result = run({"bake", "-q", "shot.ma", "-o", "-"});
  EXPECT_EQ(result.status, 0);
  EXPECT_THAT(result.out, HasSubstr("createNode camera -n \"shotcamShape\" -p \"shotcam\";"));
  EXPECT_THAT(result.err, IsEmpty());
}

TEST_F(BakeCommand, ManyWarningsOfOneKindAreCounted) {
  std::string commands;
  for (int i = 0; i < 9; ++i) commands += "<<<<<<< HEAD\n";
  write("shot.ma", unbakedScene() + commands);
  const ToolResult result = run({"bake", "shot.ma", "-o", "baked.ma"});
  EXPECT_EQ(result.status, 0);
  EXPECT_THAT(result.err, HasSubstr("6 more of these: add --report FILE to see all\n"));
  EXPECT_THAT(run({"bake", "shot.ma", "-o", "baked.ma", "--report", "all.json"}).err,
              HasSubstr("6 more of these: all are in all.json\n"));
}

}  // namespace
}  // namespace mayascene_test

// mayascene bake and import --bake, as a user runs them.
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <signal.h>

#include <filesystem>
#include <string>

#include "tests/tools/ToolRun.h"

namespace mayascene_test {
namespace {

using testing::ElementsAre;
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
  EXPECT_THAT(imported.out, HasSubstr("11 keys"));
}

TEST_F(BakeCommand, NamesTheSceneAndTheOptionsInItsFirstComment) {
  write("shot.ma", unbakedScene());
  run({"bake", "shot.ma", "--frames", "1001:1003", "--world", "-o", "baked.ma"});
  EXPECT_THAT(read("baked.ma"), HasSubstr(" from shot.ma with --frames 1001:1003 --world\n"));
}

TEST_F(BakeCommand, ImportsABakeUnderTheScenesOwnNameAndTakesItAwayAgain) {
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

TEST_F(BakeCommand, ASignalTakesTheTemporaryBakeAway) {
  std::string scene = unbakedScene();
  write("shot.ma", scene);
  // Long enough that the signal comes while the bake is there.
  const int process = start({"import", "--bake", "--quiet", "--frames", "1:1999999", "shot.ma"});
  for (int i = 0; i < 3'000 && temporariesAreGone(); ++i) usleep(10'000);
  ASSERT_FALSE(temporariesAreGone());
  ASSERT_EQ(kill(process, SIGTERM), 0);
  EXPECT_EQ(end(process).status, 128 + SIGTERM);
  EXPECT_TRUE(temporariesAreGone());
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
    EXPECT_THAT(result.err, HasSubstr("goes with --bake")) << option;
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
  EXPECT_THAT(result.err, HasSubstr("refused: it is no Maya ASCII scene"));
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
  EXPECT_THAT(result.err, HasSubstr("6 more of these, see --report"));
}

}  // namespace
}  // namespace mayascene_test

// mayascene check of folders and of several scenes at a time.
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <signal.h>

#include <chrono>
#include <filesystem>
#include <fstream>
#include <nlohmann/json.hpp>
#include <string>
#include <thread>
#include <vector>

#include "tests/tools/ToolRun.h"

namespace mayascene_test {
namespace {

using namespace std::chrono_literals;
using nlohmann::json;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;
using testing::StartsWith;

class CheckMany : public ToolTest {
 protected:
  void writeIn(const std::string& folder, const std::string& name, std::string_view commands) {
    std::filesystem::create_directories(path(folder));
    write(folder + '/' + name, sceneText(commands));
  }

  // A scene whose check takes a while.
  void writeSlow(const std::string& name) {
    std::string many;
    for (int i = 0; i < 30'000; ++i) many += "createNode camera -n \"cam" + std::to_string(i) + "\";\n";
    write(name, sceneText(many));
  }

  // The first child of the process that is seen.
  pid_t childOf(pid_t process) const {
    const std::string file =
        "/proc/" + std::to_string(process) + "/task/" + std::to_string(process) + "/children";
    pid_t child = 0;
    for (int tries = 0; child == 0 && tries < 20'000; ++tries) {
      std::ifstream(file) >> child;
      if (child == 0) std::this_thread::sleep_for(1ms);
    }
    return child;
  }

  std::vector<std::string> pathsOf(const json& document) const {
    std::vector<std::string> paths;
    for (const json& scene : document["scenes"]) paths.push_back(scene["path"]);
    return paths;
  }
};

TEST_F(CheckMany, FoldersAreSearchedAndTheirScenesComeInOrder) {
  writeIn("shots/b", "2.ma", stillCamera());
  writeIn("shots/a", "1.MA", craneCamera());
  writeIn("shots", "c.ma", "select -ne |shotcam;\n");
  write("first.ma", sceneText(stillCamera()));
  for (const char* jobs : {"1", "2", "5"}) {
    const ToolResult check = run({"check", "--jobs", jobs, "--json", "-", "first.ma", "shots"});
    EXPECT_EQ(check.status, 1);
    const json document = json::parse(check.out);
    EXPECT_THAT(pathsOf(document), ElementsAre("first.ma", "shots/a/1.MA", "shots/b/2.ma", "shots/c.ma"));
    EXPECT_EQ(document["scenes"][1]["head"]["cameras"].size(), 1u);
    EXPECT_EQ(document["scenes"][3]["status"], 1);
  }
}

TEST_F(CheckMany, TheOutputIsTheSameWhateverTheNumberOfJobs) {
  for (int i = 0; i < 12; ++i) {
    writeIn("shots", std::to_string(i) + ".ma", i % 3 == 0 ? "select -ne |shotcam;\n" : craneCamera());
  }
  const ToolResult one =
      run({"check", "--jobs", "1", "--verbose", "--json", "one.json", "shots", "missing.ma"});
  const ToolResult four =
      run({"check", "--jobs", "4", "--verbose", "--json", "four.json", "shots", "missing.ma"});
  EXPECT_EQ(one.status, 3);
  EXPECT_EQ(four.status, 3);
  EXPECT_THAT(one.out, StartsWith("shots/0.ma\n"));
  EXPECT_TRUE(one.out == four.out);
  EXPECT_TRUE(one.err == four.err);
  EXPECT_TRUE(read("one.json") == read("four.json"));
  EXPECT_EQ(json::parse(read("one.json"))["scenes"].size(), 13u);
}

TEST_F(CheckMany, AFolderWithoutScenesIsRemarkedAndIsNoError) {
  std::filesystem::create_directories(path("empty"));
  const ToolResult check = run({"check", "empty"});
  EXPECT_EQ(check.status, 0);
  EXPECT_EQ(check.err, "mayascene: empty: holds no scene\n");
  EXPECT_THAT(run({"check", "--quiet", "empty"}).err, IsEmpty());
  EXPECT_EQ(json::parse(run({"check", "--json", "-", "empty"}).out)["scenes"], json::array());
}

TEST_F(CheckMany, ASceneOfAFolderIsNotOverwrittenByTheJson) {
  writeIn("shots", "a.ma", stillCamera());
  const ToolResult check = run({"check", "--json", "shots/a.ma", "shots"});
  EXPECT_EQ(check.status, 2);
  EXPECT_THAT(check.err, HasSubstr("would be overwritten"));
  EXPECT_EQ(read("shots/a.ma"), sceneText(stillCamera()));
}

TEST_F(CheckMany, AnUnusableNumberOfJobsOrSecondsIsWrongUsage) {
  write("a.ma", sceneText(stillCamera()));
  for (const char* jobs : {"0", "257", "-1", "two"})
    EXPECT_EQ(run({"check", "--jobs", jobs, "a.ma"}).status, 2);
  for (const char* time : {"0", "-1", "nan", "soon"}) {
    EXPECT_EQ(run({"check", "--timeout", time, "a.ma"}).status, 2) << time;
  }
}

TEST_F(CheckMany, OptionsOfTheChildProcessesAreInNoHelp) {
  EXPECT_THAT(run({"check", "--help"}).out, Not(HasSubstr("child")));
}

// A child that is stopped is one that hangs.
TEST_F(CheckMany, AHangIsADiagnosticOfItsSceneAndTheOthersAreChecked) {
  writeSlow("slow.ma");
  write("still.ma", sceneText(stillCamera()));
  const int process = start({"check", "--jobs", "1", "--timeout", "3", "--json", "-", "slow.ma", "still.ma"});
  ::kill(childOf(process), SIGSTOP);
  const ToolResult check = end(process);
  EXPECT_EQ(check.status, 1);
  const json document = json::parse(check.out);
  ASSERT_EQ(document["scenes"].size(), 2u);
  EXPECT_EQ(document["scenes"][0]["diagnostics"][0]["code"], "MA1001");
  EXPECT_EQ(document["scenes"][0]["diagnostics"][0]["arguments"], json({"3 s"}));
  EXPECT_EQ(document["scenes"][1]["status"], 0);
}

TEST_F(CheckMany, ACrashIsADiagnosticOfItsSceneAndTheOthersAreChecked) {
  writeSlow("slow.ma");
  write("still.ma", sceneText(stillCamera()));
  const int process = start({"check", "--jobs", "1", "slow.ma", "still.ma"});
  ::kill(childOf(process), SIGKILL);
  const ToolResult check = end(process);
  EXPECT_EQ(check.status, 1);
  EXPECT_THAT(check.out, StartsWith("slow.ma: error: the check broke off: its process was ended by signal 9 "
                                    "(Killed) [MA1002]\n"));
  EXPECT_THAT(check.out, HasSubstr("\nstill.ma: no errors, "));
}

TEST_F(CheckMany, AnInterruptedRunLeavesNoReportAndNoChild) {
  writeSlow("slow.ma");
  write("out.json", "before");
  const int process = start({"check", "--json", "out.json", "slow.ma", "slow.ma"});
  const pid_t child = childOf(process);
  ::kill(process, SIGTERM);
  EXPECT_EQ(end(process).status, 143);
  EXPECT_NE(::kill(child, 0), 0);
  EXPECT_EQ(read("out.json"), "before");
  EXPECT_THAT(files(), ElementsAre("out.json", "slow.ma"));
}

TEST_F(CheckMany, ProgressIsShownOnATerminalAlone) {
  for (const char* name : {"a.ma", "b.ma", "c.ma"}) write(name, sceneText(stillCamera()));
  const std::string shown = runOnTerminal({"check", "a.ma", "b.ma", "c.ma"}).out;
  EXPECT_THAT(shown, HasSubstr(" of 3 done, 0 failed"));
  EXPECT_THAT(shown, HasSubstr("c.ma: no errors, "));
  EXPECT_THAT(runOnTerminal({"check", "--quiet", "a.ma", "b.ma", "c.ma"}).out, IsEmpty());
  EXPECT_THAT(runOnTerminal({"check", "a.ma"}).out, Not(HasSubstr(" done, ")));
  EXPECT_THAT(run({"check", "a.ma", "b.ma", "c.ma"}).err, IsEmpty());
  environment["TERM"] = "dumb";
  EXPECT_THAT(runOnTerminal({"check", "a.ma", "b.ma", "c.ma"}).out, Not(HasSubstr(" done, ")));
}

}  // namespace
}  // namespace mayascene_test

// A run that a signal ends.
#include <gtest/gtest.h>
#include <signal.h>
#include <sys/stat.h>
#include <unistd.h>

#include <chrono>
#include <string>
#include <thread>
#include <vector>

#include "tests/tools/ToolRun.h"

namespace mayascene_test {
namespace {

using namespace std::chrono_literals;

class Interruption : public ToolTest {
 protected:
  Interruption() {
    std::string many = sceneText("");
    for (int i = 0; i < 30'000; ++i) many += "createNode camera -n \"cam" + std::to_string(i) + "\";\n";
    write("many.ma", many);
  }

  // Starts an import that takes a while and interrupts it once its output has been begun.
  ToolResult interrupted(int signal) {
    write("out.json", "before");
    const int process = start({"import", "--quiet", "--json", "out.json", "many.ma"});
    for (int tries = 0; files().size() < 3 && tries < 10'000; ++tries) std::this_thread::sleep_for(1ms);
    ::kill(process, signal);
    return end(process);
  }

  // The same once there is something in a file.
  ToolResult interruptedWhenThereIs(const std::string& name, std::vector<std::string> arguments) {
    const int process = start(arguments);
    for (int tries = 0; read(name).empty() && tries < 10'000; ++tries) std::this_thread::sleep_for(1ms);
    ::kill(process, SIGINT);
    return end(process);
  }
};

TEST_F(Interruption, AnInterruptedRunEndsWith130AndLeavesNoPartialOutput) {
  const ToolResult result = interrupted(SIGINT);
  EXPECT_EQ(result.status, 130);
  EXPECT_TRUE(read("out.json") == "before");
  EXPECT_EQ(files(), (std::vector<std::string>{"many.ma", "out.json"}));
}

TEST_F(Interruption, AHangUpLeavesNoPartialOutputEither) {
  const ToolResult result = interrupted(SIGHUP);
  EXPECT_EQ(result.status, 129);
  EXPECT_TRUE(read("out.json") == "before");
  EXPECT_EQ(files(), (std::vector<std::string>{"many.ma", "out.json"}));
}

// The trace is a log: where it ends shows how far the run came. Nothing else is left, with both outputs at
// work.
TEST_F(Interruption, WhileTheTraceIsWrittenTheJsonIsNotThereAndTheTraceIsItsBeginning) {
  const ToolResult result = interruptedWhenThereIs(
      "calls.jsonl", {"import", "--quiet", "--json", "out.json", "--trace", "calls.jsonl", "many.ma"});
  EXPECT_EQ(result.status, 130);
  EXPECT_EQ(files(), (std::vector<std::string>{"calls.jsonl", "many.ma"}));
  EXPECT_EQ(read("calls.jsonl").find("{\"call\":\"enter\""), 0u);
}

TEST_F(Interruption, ThePreferenceStoreIsWholeAndNothingLiesBesideIt) {
  const ToolResult result =
      interruptedWhenThereIs("store", {"import", "--quiet", "--preferences", "store", "many.ma"});
  EXPECT_EQ(result.status, 130);
  EXPECT_EQ(read("store"), "[Maya Camera]\nUse Linear Units=0\n");
  EXPECT_EQ(files(), (std::vector<std::string>{"many.ma", "store"}));
}

TEST_F(Interruption, ATerminatedRunLeavesNoPartialOutputEither) {
  const ToolResult result = interrupted(SIGTERM);
  EXPECT_EQ(result.status, 143);
  EXPECT_TRUE(read("out.json") == "before");
  EXPECT_EQ(files(), (std::vector<std::string>{"many.ma", "out.json"}));
}

}  // namespace
}  // namespace mayascene_test

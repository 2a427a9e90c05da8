// mayascene check where the processes that check single scenes cannot do their work.
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/wait.h>

#include <cstdlib>
#include <filesystem>
#include <nlohmann/json.hpp>
#include <string>

#include "tests/tools/ToolRun.h"

namespace mayascene_test {
namespace {

using nlohmann::json;
using testing::HasSubstr;
using testing::IsEmpty;

class CheckChildren : public ToolTest {
 protected:
  // Runs a line of the shell in the folder; its exit status.
  int shell(const std::string& line) const {
    const std::string whole =
        "cd '" + path("").string() + "' && XDG_CONFIG_HOME='" + path("").string() + "' && " + line;
    return WEXITSTATUS(std::system(("export XDG_CONFIG_HOME; " + whole).c_str()));
  }
};

// Sanitizers need more address space than there is memory.
#if !MAYASCENE_SANITIZED
TEST_F(CheckChildren, ASceneThatTheMemoryDoesNotHoldHasThatAsItsDiagnosticAndTheOthersAreChecked) {
  write("large.ma", sceneText(std::string(stillCamera()) + std::string(128 << 20, ' ')));
  write("still.ma", sceneText(stillCamera()));
  const std::string check =
      std::string("ulimit -v 120000 && '") + MAYASCENE_TOOL + "' check --json report.json large.ma still.ma";
  EXPECT_EQ(shell(check + " >out.txt 2>err.txt"), 1) << read("err.txt");
  const json document = json::parse(read("report.json"));
  ASSERT_EQ(document["scenes"].size(), 2u);
  ASSERT_EQ(document["scenes"][0]["diagnostics"].size(), 1u) << document["scenes"][0];
  EXPECT_EQ(document["scenes"][0]["diagnostics"][0]["code"], "MA1003");
  EXPECT_EQ(document["scenes"][0]["status"], 1);
  EXPECT_EQ(document["scenes"][1]["status"], 0);
  EXPECT_EQ(document["scenes"][1]["head"]["camerasThatCame"], 1);
}
#endif

// The tool looks for the module beside itself.
TEST_F(CheckChildren, AMissingModuleIsSaidOnceAndTheStatusIsFour) {
  const std::filesystem::path tool(MAYASCENE_TOOL);
  for (const char* folder : {"alone/bin", "alone/lib"}) std::filesystem::create_directories(path(folder));
  std::filesystem::copy_file(tool, path("alone/bin/mayascene"));
  std::filesystem::copy_file(tool.parent_path() / "../lib/libhostutil.so", path("alone/lib/libhostutil.so"));
  for (const char* name : {"1.ma", "2.ma", "3.ma", "4.ma", "5.ma"}) write(name, sceneText(stillCamera()));
  for (const char* jobs : {"1", "2"}) {
    const std::string check = std::string("alone/bin/mayascene check --jobs ") + jobs + " *.ma";
    EXPECT_EQ(shell(check + " >out.txt 2>err.txt"), 4);
    EXPECT_THAT(read("out.txt"), IsEmpty());
    const std::string said = read("err.txt");
    EXPECT_THAT(said, HasSubstr("mayascene: the module cannot be loaded: "));
    EXPECT_EQ(said.find("module cannot be loaded"), said.rfind("module cannot be loaded")) << said;
  }
}

}  // namespace
}  // namespace mayascene_test

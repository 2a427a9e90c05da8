// The tool's complaints about a module that leaves things behind and breaks its promises to the host.
#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <string>

#include "tests/tools/ToolRun.h"

namespace mayascene_test {
namespace {

class CarelessModule : public ToolTest {
 protected:
  CarelessModule() { write("scene.ma", sceneText("")); }

  ToolResult import(std::vector<std::string> further) {
    further.insert(further.begin(), {"import", "--module", CARELESS_MODULE});
    return run(further);
  }
};

bool contains(const std::string& text, const std::string& part) {
  return text.find(part) != std::string::npos;
}

TEST_F(CarelessModule, LeftoversAreListedOneALineAndAreStatusOne) {
  const ToolResult result = import({"scene.ma"});
  EXPECT_EQ(result.status, 1);
  EXPECT_TRUE(contains(result.err, "mayascene: scene.ma: left behind: mem:1 (forgotten, 12 bytes)\n"))
      << result.err;
  EXPECT_TRUE(contains(result.err,
                       "mayascene: the module's entry: left behind: suite QZGP File Import Manager Suite"))
      << result.err;
}

TEST_F(CarelessModule, TheEntrysLeftoversAreStatusOneByThemselves) {
  const ToolResult result = run({"verify", "--quiet", "scene.ma", "--module", CARELESS_MODULE});
  EXPECT_EQ(result.status, 1);
  EXPECT_EQ(result.out, "");
}

TEST_F(CarelessModule, RefusalsGoToStandardErrorAndIntoTheJsonAndNotAmongTheMessages) {
  const ToolResult result = import({"scene.ma", "--json", "out.json"});
  EXPECT_TRUE(contains(result.err, "mayascene: scene.ma: the host refused: FreeMemHandle")) << result.err;
  EXPECT_FALSE(contains(result.out, "FreeMemHandle")) << result.out;
  const auto scene = nlohmann::json::parse(read("out.json"))["scenes"][0];
  ASSERT_EQ(scene["refusals"].size(), 1u);
  EXPECT_EQ(scene["refusals"][0].get<std::string>().find("FreeMemHandle"), 0u);
  EXPECT_EQ(scene["messages"], nlohmann::json::parse(R"(["look\u001b[5m here"])"));
  EXPECT_EQ(scene["leftovers"][0]["keptByDesign"], false);
}

TEST_F(CarelessModule, MessagesAreEscaped) {
  const ToolResult result = import({"scene.ma"});
  EXPECT_TRUE(contains(result.out, "\nmessages\n  look\\x1b[5m here\n")) << result.out;
}

TEST_F(CarelessModule, AnExceptionOutOfTheModuleIsACodeAndTheRunGoesOn) {
  write("throws", sceneText(""));
  const ToolResult result = import({"throws", "scene.ma"});
  EXPECT_EQ(result.status, 1);
  EXPECT_TRUE(contains(result.err, "mayascene: throws: error 2052 (EXCEPTION_OTHER): ")) << result.err;
  EXPECT_TRUE(contains(result.err, "mayascene: scene.ma: ")) << result.err;
}

}  // namespace
}  // namespace mayascene_test

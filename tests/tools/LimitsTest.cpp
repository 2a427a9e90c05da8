// The limits that the command line sets, by their effect.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <chrono>
#include <nlohmann/json.hpp>
#include <string>

#include "refhost/Host.h"
#include "tests/tools/ToolRun.h"

namespace mayascene_test {
namespace {

using testing::HasSubstr;

class Limits : public ToolTest {
 protected:
  Limits() {
    write("still.ma", sceneText(stillCamera()));
    write("crane.ma", sceneText(craneCamera()));
  }
};

TEST_F(Limits, LayersBeyondTheMostAreACodeAndASentenceAndTheOthersAreShown) {
  const ToolResult result = run({"import", "--most-layers", "1", "crane.ma"});
  EXPECT_EQ(result.status, 1);
  EXPECT_THAT(result.err, HasSubstr("error 3034 (TOO_MANY_LAYERS)"));
  EXPECT_THAT(result.err, HasSubstr("the host takes no more than 1 layers"));
  EXPECT_THAT(result.out, HasSubstr("crane.ma: 1 composition"));
}

TEST_F(Limits, KeysBeyondTheMostAreACodeAndTheFirstOnesStay) {
  const ToolResult result = run({"import", "--most-keys", "2", "--json", "out.json", "crane.ma"});
  EXPECT_EQ(result.status, 1);
  EXPECT_THAT(result.err, HasSubstr("error 3035 (TOO_MANY_KEYS)"));
  EXPECT_THAT(result.err, HasSubstr("the host takes no more than 2 keys"));
  std::size_t keys = 0;
  const auto report = nlohmann::json::parse(read("out.json"));
  for (const auto& layer : report["scenes"][0]["compositions"][0]["layers"]) {
    for (const auto& stream : layer["streams"]) {
      if (!stream["keys"].is_null()) keys += stream["keys"]["times"].size();
    }
  }
  EXPECT_EQ(keys, 2u) << report;
}

TEST_F(Limits, MemoryBeyondTheMostIsACode) {
  const ToolResult result = run({"import", "--most-memory", "10", "still.ma"});
  EXPECT_EQ(result.status, 1);
  EXPECT_THAT(result.err, HasSubstr("error 3036 (TOO_MUCH_MEMORY)"));
  EXPECT_THAT(result.err, HasSubstr("left of 10"));
}

TEST_F(Limits, WhatLiesWithinThemIsImported) {
  EXPECT_EQ(run({"import", "--most-layers", "100", "--most-keys", "1000", "--most-memory", "1000000",
                 "still.ma", "crane.ma"})
                .status,
            0);
}

TEST_F(Limits, TheyCountOverAllScenesOfARun) {
  EXPECT_EQ(run({"import", "--most-layers", "1", "still.ma"}).status, 0);
  EXPECT_EQ(run({"import", "--most-layers", "1", "still.ma", "still.ma"}).status, 1);
}

TEST_F(Limits, ANumberThatIsNoneIsWrongUsage) {
  for (const char* const option : {"--most-layers", "--most-keys", "--most-memory"}) {
    for (const char* const number : {"-1", "many", "99999999999999999999"}) {
      EXPECT_EQ(run({"import", option, number, "still.ma"}).status, 2) << option << " " << number;
    }
  }
}

TEST_F(Limits, TheHelpNamesTheDefaults) {
  const refhost::HostOptions defaults;
  const std::string help = run({"import", "--help-all"}).out;
  EXPECT_THAT(help, HasSubstr("layers that the project takes (" + std::to_string(defaults.mostLayers) + ")"));
  EXPECT_THAT(help, HasSubstr("keys that the project takes (" + std::to_string(defaults.mostKeys) + ")"));
  EXPECT_THAT(help,
              HasSubstr("that the importer holds at one time (" + std::to_string(defaults.mostMemory) + ")"));
}

// Each locator has a chain of parents of its own: a text of a few kilobytes that asks for a hundred million
// layers.
TEST_F(Limits, ASmallTextThatAsksForLayersWithoutEndEndsInSeconds) {
  constexpr int kChain = 10'000;
  constexpr int kLocators = 10'000;
  std::string scene = "createNode camera -n \"cam\";\n";
  for (int i = 0; i < kChain; ++i) {
    scene +=
        "createNode transform -n \"n" + std::to_string(i) + "\" -p \"n" + std::to_string(i - 1) + "\";\n";
  }
  for (int i = 0; i < kLocators; ++i) {
    scene += "createNode locator -n \"null\" -p \"n" + std::to_string(kChain - 1) + "\";\n";
  }
  write("endless.ma", sceneText(scene));
  const auto start = std::chrono::steady_clock::now();
  const ToolResult result = run({"import", "--quiet", "--most-layers", "50000", "endless.ma"});
  EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(60));
  EXPECT_EQ(result.status, 1);
  EXPECT_THAT(result.err, HasSubstr("TOO_MANY_LAYERS"));
}

}  // namespace
}  // namespace mayascene_test

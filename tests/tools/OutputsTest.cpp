// Where outputs go, and that they come whole or not at all.
#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <string>

#include "tests/tools/ToolRun.h"

namespace mayascene_test {
namespace {

using nlohmann::json;
using Names = std::vector<std::string>;

class Outputs : public ToolTest {
 protected:
  Outputs() {
    write("still.ma", sceneText(stillCamera()));
    write("notes.txt", "just some notes\n");
  }
};

TEST_F(Outputs, JsonToStandardOutputStandsAlone) {
  const ToolResult result = run({"import", "still.ma", "--json", "-"});
  EXPECT_EQ(result.status, 0);
  const json document = json::parse(result.out);
  EXPECT_EQ(document["format"], "mayascene-composition");
  EXPECT_EQ(document["scenes"][0]["path"], "still.ma");
  EXPECT_EQ(document["scenes"][0]["compositions"][0]["layers"][0]["streams"][6]["value"],
            json::parse("[640]"));
}

TEST_F(Outputs, JsonToAFileStandsBesideTheOutline) {
  const ToolResult result = run({"import", "still.ma", "--json", "out.json"});
  EXPECT_EQ(result.out.find("still.ma: 1 composition"), 0u);
  EXPECT_EQ(read("out.json"), run({"import", "still.ma", "--json", "-"}).out);
  EXPECT_EQ(files(), (Names{"notes.txt", "out.json", "still.ma"}));
}

TEST_F(Outputs, OneSceneAndSeveralHaveOneForm) {
  const json document =
      json::parse(run({"import", "still.ma", "notes.txt", "missing.ma", "--json", "-"}).out);
  ASSERT_EQ(document["scenes"].size(), 3u);
  EXPECT_EQ(document["scenes"][0]["outcome"], "imported");
  EXPECT_EQ(document["scenes"][1]["outcome"], "refused");
  EXPECT_EQ(document["scenes"][1]["messages"],
            json::parse("[\"Only Baked Maya Ascii files are supported.\"]"));
  EXPECT_EQ(document["scenes"][2]["outcome"], "unreadable");
  EXPECT_EQ(document["scenes"][2]["status"], 3);
}

TEST_F(Outputs, JsonAndTraceCanGoToTwoPlacesButNotBothToStandardOutput) {
  EXPECT_EQ(run({"import", "still.ma", "--json", "-", "--trace", "-"}).status, 2);
  const ToolResult result = run({"import", "still.ma", "--json", "-", "--trace", "calls.jsonl"});
  EXPECT_EQ(result.status, 0);
  EXPECT_TRUE(json::accept(result.out));
  EXPECT_EQ(read("calls.jsonl").find("{\"call\":\"enter\",\"callback\":\"GPMain_MayaImport\""), 0u);
}

TEST_F(Outputs, MessagesGoToStandardErrorWhereThereIsNoOutline) {
  const ToolResult result = run({"import", "notes.txt", "--json", "-"});
  EXPECT_EQ(result.status, 1);
  EXPECT_TRUE(json::accept(result.out));
  EXPECT_EQ(result.err.find("mayascene: notes.txt: message: Only Baked Maya Ascii files are supported.\n"),
            0u)
      << result.err;
}

TEST_F(Outputs, WithoutAModuleWhatLayThereStays) {
  write("out.json", "before");
  EXPECT_EQ(run({"import", "still.ma", "--json", "out.json", "--module", "missing.so"}).status, 4);
  EXPECT_EQ(read("out.json"), "before");
  EXPECT_EQ(files(), (Names{"notes.txt", "out.json", "still.ma"}));
}

TEST_F(Outputs, AClosedStandardOutputCannotBeWrittenAndItsTextGoesIntoNoOtherOutput) {
  const std::string whole = run({"import", "still.ma", "--json", "-"}).out;
  closedDescriptors = {1};
  const ToolResult result = run({"import", "still.ma", "--json", "out.json", "--trace", "calls.jsonl"});
  EXPECT_EQ(result.status, 5);
  EXPECT_TRUE(result.err.ends_with("mayascene: standard output cannot be written: Bad file descriptor\n"))
      << result.err;
  EXPECT_EQ(read("out.json"), whole);
  EXPECT_EQ(read("calls.jsonl").find("{\"call\":\"enter\""), 0u);
}

TEST_F(Outputs, WhatGoesToAClosedStandardErrorGoesIntoNoOutput) {
  const std::string whole = run({"import", "notes.txt", "--json", "-"}).out;
  for (const std::vector<int>& closed : {std::vector{2}, {0, 2}, {0, 1, 2}}) {
    closedDescriptors = closed;
    EXPECT_EQ(run({"import", "--quiet", "notes.txt", "--json", "out.json"}).status, 1);
    EXPECT_EQ(read("out.json"), whole);
  }
}

TEST_F(Outputs, AnOutlineThatCannotBeWrittenIsReportedToo) {
  const ToolResult result = run({"import", "still.ma", "--quiet", "--trace", "/dev/full"});
  EXPECT_EQ(result.status, 5);
  EXPECT_EQ(result.err, "mayascene: /dev/full cannot be written: No space left on device\n");
}

}  // namespace
}  // namespace mayascene_test

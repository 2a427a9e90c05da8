// Each output of the tool for a scene with hostile names: names of every byte that a name can hold, texts
// that try to leave their quotes, and names that look like paths.
#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <nlohmann/json.hpp>
#include <sstream>
#include <string>
#include <vector>

#include "tests/tools/ToolRun.h"

namespace mayascene_test {
namespace {

using nlohmann::json;

constexpr int kBytesOfAName = 250;  // shorter than what the importer cuts

bool contains(const std::string& text, const std::string& part) {
  return text.find(part) != std::string::npos;
}

// Valid UTF-8 in lines, without a control character of either set.
void expectEscaped(const std::string& text, const std::string& from) {
  EXPECT_FALSE(text.empty()) << from;
  // Strict: it throws where a byte is not valid UTF-8.
  EXPECT_NO_THROW(json(text).dump()) << from;
  for (std::size_t i = 0; i < text.size(); ++i) {
    const auto byte = static_cast<unsigned char>(text[i]);
    EXPECT_TRUE(byte == '\n' || (byte >= 0x20 && byte != 0x7f)) << from << ", byte " << i << ": " << +byte;
    const bool secondSet =
        byte == 0xc2 && i + 1 < text.size() && static_cast<unsigned char>(text[i + 1]) < 0xa0;
    EXPECT_FALSE(secondSet) << from << ", byte " << i;
  }
}

// Every byte but those that end a name or begin an escape, each between letters.
std::string everyByte() {
  std::string bytes;
  for (int code = 1; code < 0x100; ++code) {
    if (code != '"' && code != '\\') bytes += static_cast<char>(code);
  }
  return bytes;
}

class EscapedOutputs : public ToolTest {
 protected:
  EscapedOutputs() { environment["NO_COLOR"] = "1"; }

  // A camera, its parent and a marked locator of the name, which is also that of a missing parent.
  void writeScene(const std::string& name) {
    write("named.ma", sceneText("createNode transform -n \"" + name + "\" -p \"" + name +
                                "x\";\n"
                                "createNode camera -n \"" +
                                name + "\" -p \"" + name +
                                "\";\n"
                                "createNode locator -n \"" +
                                name + "null\" -p \"" + name + "\";\n"));
  }

  void expectEscapedOutputs(const std::vector<std::string>& further, const std::string& from) {
    std::vector<std::string> arguments = {"import", "named.ma"};
    arguments.insert(arguments.end(), further.begin(), further.end());
    const ToolResult result = runOnTerminal(arguments);
    EXPECT_EQ(result.status, 0) << result.out;
    expectEscaped(result.out, from);
  }
};

TEST_F(EscapedOutputs, NoByteOfANameIsAControlCharacterInAnyOutput) {
  const std::string bytes = everyByte();
  for (std::size_t from = 0; from < bytes.size(); from += kBytesOfAName / 2) {
    writeScene("name" + bytes.substr(from, kBytesOfAName / 2) + "end");
    expectEscapedOutputs({}, "outline");
    expectEscapedOutputs({"--json", "-"}, "JSON");
    expectEscapedOutputs({"--quiet", "--trace", "-"}, "trace");
  }
}

TEST_F(EscapedOutputs, ControlsOfTheSecondSetAndMisusedUtf8AreEscapedInAnyOutput) {
  writeScene(
      "\xc2\x9b"
      "31m\xc2\x85|\xed\xa0\x80|\xf4\x90\x80\x80|\xe0\x80\x8a|\xc0\x9b|\xe2\x80\xae|\xf0\x9f");
  expectEscapedOutputs({}, "outline");
  expectEscapedOutputs({"--json", "-"}, "JSON");
  expectEscapedOutputs({"--quiet", "--trace", "-"}, "trace");
}

TEST_F(EscapedOutputs, TheWritingDirectionOfTheOutlineCannotBeTurned) {
  writeScene(
      "cam\xe2\x80\xae"
      "am.exe\xe2\x81\xa9");
  const std::string outline = run({"import", "named.ma"}).out;
  EXPECT_TRUE(contains(outline, "\"cam\\u202eam.exe\\u2069\"")) << outline;
  EXPECT_FALSE(contains(outline, "\xe2\x80\xae"));
}

TEST_F(EscapedOutputs, AnEscapeAtTheEndOfANameLeavesTheColourAfterItWhole) {
  environment.clear();
  writeScene("cam\x1b");
  const std::string outline = runOnTerminal({"import", "named.ma"}).out;
  EXPECT_TRUE(contains(outline, "\x1b[1m\"cam\\x1b\"\x1b[0m")) << outline;
}

TEST_F(EscapedOutputs, ANameCannotLeaveItsQuotesInJsonAndTraces) {
  writeScene("x\\\",\\\"owned\\\":true,\\\"y\\\":[\\\\z");
  const ToolResult result = run({"import", "named.ma", "--json", "-", "--trace", "trace"});
  ASSERT_EQ(result.status, 0) << result.err;
  const json report = json::parse(result.out);
  const json& layers = report["scenes"][0]["compositions"][0]["layers"];
  ASSERT_GE(layers.size(), 3u);
  bool seen = false;
  for (const json& layer : layers) {
    EXPECT_FALSE(layer.contains("owned"));
    seen = seen || contains(layer["name"], "owned");
  }
  EXPECT_TRUE(seen) << layers;
  std::istringstream trace(read("trace"));
  for (std::string line; std::getline(trace, line);)
    EXPECT_FALSE(json::parse(line).contains("owned")) << line;
}

TEST_F(EscapedOutputs, PathPartsInANameMakeNoFile) {
  // Where a name with "../" would lead to is a folder that is looked at too.
  std::filesystem::create_directories(path("inner"));
  workingFolder = path("inner");
  for (const char* name :
       {"../climbed", "./here", "..", "a/../../b", "..\\climbed", "C:stream", "nul", "-rf", "~"}) {
    writeScene(name);
    const ToolResult result = run({"import", "../named.ma", "--json", "out.json", "--trace", "trace"});
    EXPECT_EQ(result.status, 0) << result.err;
    const json report = json::parse(read("inner/out.json"));
    const json& layers = report["scenes"][0]["compositions"][0]["layers"];
    EXPECT_TRUE(std::any_of(layers.begin(), layers.end(), [name](const json& layer) {
      return layer["name"] == name;
    })) << name;
  }
  EXPECT_EQ(files(), (std::vector<std::string>{"inner", "named.ma"}));
  std::vector<std::string> inner;
  for (const auto& entry : std::filesystem::directory_iterator(path("inner")))
    inner.push_back(entry.path().filename());
  std::sort(inner.begin(), inner.end());
  EXPECT_EQ(inner, (std::vector<std::string>{"out.json", "trace"}));
}

TEST_F(EscapedOutputs, MessagesOfATranslationAreEscaped) {
  write("translations", "$$$/QZ/Maya_Import/LStr/0004=\x1b[31mred\xff\n");
  write("cut.ma", sceneText("createNode camera -n \"cam"));
  const ToolResult shown = runOnTerminal({"import", "cut.ma", "--translations", "translations"});
  EXPECT_TRUE(contains(shown.out, "\\x1b[31mred\xef\xbf\xbd")) << shown.out;
  expectEscaped(shown.out, "outline");
  expectEscaped(runOnTerminal({"import", "--quiet", "cut.ma", "--translations", "translations"}).out,
                "quiet");
}

TEST_F(EscapedOutputs, WhatIsNamedOnTheCommandLineIsEscapedWhereItIsShownAgain) {
  const std::string odd = "a\x1b[31m\xff\n\xc2\x9b";
  write("named.ma", sceneText(""));
  // The preference store comes last: its folder is made.
  for (const char* option : {"--module", "--translations", "--json", "--trace", "--fail", "--refuse",
                             "--during", "--linear-units", "--no-such-option", "--preferences"}) {
    const ToolResult result = runOnTerminal({"import", "named.ma", option, odd + "/missing"});
    EXPECT_EQ(result.status == 0, option == std::string("--preferences")) << option;
    expectEscaped(result.out, option);
  }
  expectEscaped(runOnTerminal({odd}).out, "verb");
  expectEscaped(runOnTerminal({"prefs", "set", odd, "1"}).out, "prefs");
  expectEscaped(runOnTerminal({"prefs", "--preferences", odd}).out, "prefs");
}

}  // namespace
}  // namespace mayascene_test

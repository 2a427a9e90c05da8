// Untrusted names on a terminal and in JSON.
#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <string>

#include "tests/tools/ToolRun.h"

namespace mayascene_test {
namespace {

using nlohmann::json;

bool contains(const std::string& text, const std::string& part) {
  return text.find(part) != std::string::npos;
}

class HostileNames : public ToolTest {
 protected:
  std::string layerName(const std::string& name) {
    write("named.ma", sceneText("createNode camera -n \"" + name + "\";\n"));
    const ToolResult result = run({"import", "named.ma", "--json", "-"});
    EXPECT_EQ(result.status, 0) << result.err;
    return json::parse(result.out)["scenes"][0]["compositions"][0]["layers"][0]["name"];
  }

  std::string outline() { return run({"import", "-v", "named.ma"}).out; }
};

TEST_F(HostileNames, EscapeSequencesDoNotReachTheTerminal) {
  EXPECT_EQ(layerName("\x1b]0;owned\a\x1b[2J"), "\x1b]0;owned\a\x1b[2J");
  EXPECT_TRUE(contains(outline(), "camera \"\\x1b]0;owned\\x07\\x1b[2J\"\n")) << outline();
}

TEST_F(HostileNames, MarkupIsJustText) {
  EXPECT_EQ(layerName("<script>&amp;</script>"), "<script>&amp;</script>");
  EXPECT_TRUE(contains(outline(), "camera \"<script>&amp;</script>\"\n"));
}

TEST_F(HostileNames, BytesThatAreNoUtf8AreReplaced) {
  EXPECT_EQ(layerName("cam\xe9ra"), "cam\xef\xbf\xbdra");
  EXPECT_TRUE(contains(outline(), "camera \"cam\xef\xbf\xbdra\"\n"));
}

TEST_F(HostileNames, AnEmptyNameIsShownAsOne) {
  EXPECT_EQ(layerName(""), "");
  EXPECT_TRUE(contains(outline(), "camera \"\"\n"));
}

TEST_F(HostileNames, TheJsonItselfHoldsNoControlCharacters) {
  write("named.ma", sceneText("createNode camera -n \"\x1b[31m\xc2\x9b\x7f\";\n"));
  const std::string text = run({"import", "named.ma", "--json", "-"}).out;
  for (const char letter : text) EXPECT_TRUE(letter == '\n' || (letter >= ' ' && letter < '\x7f'));
}

TEST_F(HostileNames, AFileNameIsEscapedLikeTheNameOfANode) {
  const std::string name = "a\n\x1b[31m\xff.ma";
  write(name, sceneText("createNode camera -n \"cam\";\n"));
  const ToolResult result = run({"import", name});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.out.find("a\\n\\x1b[31m\xef\xbf\xbd.ma: 1 composition"), 0u) << result.out;
  EXPECT_FALSE(contains(result.out + result.err, "\x1b"));
  const ToolResult verified = run({"verify", name, name + "missing"});
  EXPECT_FALSE(contains(verified.out + verified.err, "\x1b"));
  const ToolResult wrong = run({"import", "--json", name + "/x", name});
  EXPECT_EQ(wrong.status, 5);
  EXPECT_FALSE(contains(wrong.err, "\x1b"));
}

class Colour : public ToolTest {
 protected:
  Colour() { write("still.ma", sceneText(stillCamera())); }
};

TEST_F(Colour, ATerminalGetsColour) {
  EXPECT_TRUE(contains(runOnTerminal({"import", "still.ma"}).out, "\x1b[1m\"shotcamShape\"\x1b[0m"));
  EXPECT_TRUE(contains(runOnTerminal({"import", "missing.ma"}).out, "\x1b[31m"));
}

TEST_F(Colour, NoColorMeansNoneWhateverItsValue) {
  for (const char* value : {"1", "0", ""}) {
    environment["NO_COLOR"] = value;
    EXPECT_FALSE(contains(runOnTerminal({"import", "still.ma", "missing.ma"}).out, "\x1b")) << value;
  }
}

TEST_F(Colour, ADumbTerminalAndAFileGetNone) {
  environment["TERM"] = "dumb";
  EXPECT_FALSE(contains(runOnTerminal({"import", "still.ma", "missing.ma"}).out, "\x1b"));
  environment.clear();
  const ToolResult piped = run({"import", "still.ma", "missing.ma"});
  EXPECT_FALSE(contains(piped.out + piped.err, "\x1b"));
}

}  // namespace
}  // namespace mayascene_test

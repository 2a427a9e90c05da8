// Every example scene, imported by the tool, makes exactly the calls of its golden trace.
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/wait.h>

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <nlohmann/json.hpp>
#include <set>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

#include "tests/support/TemporaryFolder.h"

namespace {

namespace fs = std::filesystem;
using Json = nlohmann::ordered_json;

constexpr double kTolerance = 1e-12;  // times the larger of 1 and the magnitude
constexpr char kLinearUnits[] = "--linear-units 1";

fs::path sourceDir() { return MAYASCENE_SOURCE_DIR; }
fs::path examplesDir() { return sourceDir() / "examples"; }
fs::path goldenDir() { return sourceDir() / "tests" / "examples" / "golden"; }

std::set<std::string> stemsIn(const fs::path& folder, const char* extension) {
  std::set<std::string> stems;
  for (const fs::directory_entry& entry : fs::directory_iterator(folder)) {
    if (entry.path().extension() == extension) stems.insert(entry.path().stem().string());
  }
  return stems;
}

std::string contentsOf(const fs::path& path) {
  std::ifstream file(path, std::ios::binary);
  std::ostringstream text;
  text << file.rdbuf();
  return text.str();
}

// The comment lines with which a scene begins.
std::string openingComment(const std::string& scene) {
  std::istringstream lines(scene);
  std::string comment, line;
  while (std::getline(lines, line) && line.starts_with("//")) comment += line + "\n";
  return comment;
}

std::string quoted(const fs::path& path) { return "'" + path.string() + "'"; }

// Whether the host's calls ended well, by the lines with which callbacks are left.
bool imports(const std::string& trace) {
  std::istringstream lines(trace);
  for (std::string line; std::getline(lines, line);) {
    const Json call = Json::parse(line);
    if (call.at("call") == "leave" && call.at("error") != 0) return false;
  }
  return true;
}

std::string traceOfImport(const std::string& stem) {
  const testsupport::TemporaryFolder scratch;
  const fs::path trace = scratch.path() / "trace";
  const std::string comment = openingComment(contentsOf(examplesDir() / (stem + ".ma")));
  std::string command = "cd " + quoted(sourceDir()) + " && " + quoted(MAYASCENE_TOOL) +
                        " import --quiet --preferences " + quoted(scratch.path() / "preferences") +
                        " --trace " + quoted(trace);
  if (comment.find(kLinearUnits) != std::string::npos) command += std::string(" ") + kLinearUnits;
  command += " examples/" + stem + ".ma";
  const int status = std::system(command.c_str());
  const std::string text = contentsOf(trace);
  EXPECT_EQ(WEXITSTATUS(status), imports(text) ? 0 : 1) << command;
  return text;
}

// Where the trace holds doubles. Every other number is an integer and compared exactly.
bool holdsDoubles(const std::string& call, const std::string& key) {
  static const std::set<std::pair<std::string, std::string>> places = {{"NewCameraLayer", "center"},
                                                                       {"SetCameraFilmSize", "filmSize"},
                                                                       {"SetStreamValue", "value"},
                                                                       {"SetBatchKeyframeValue", "value"}};
  return places.count({call, key}) != 0;
}

bool near(const Json& expected, const Json& found) {
  if (expected.is_array()) {
    return found.is_array() && expected.size() == found.size() &&
           std::equal(expected.begin(), expected.end(), found.begin(), near);
  }
  if (!expected.is_number() || !found.is_number()) return expected == found;
  const double a = expected.get<double>();
  const double b = found.get<double>();
  return std::abs(a - b) <= kTolerance * std::max({1.0, std::abs(a), std::abs(b)});
}

bool sameLine(const std::string& expectedLine, const std::string& foundLine) {
  if (expectedLine == foundLine) return true;
  const Json expected = Json::parse(expectedLine);
  const Json found = Json::parse(foundLine);
  if (expected.size() != found.size()) return false;
  auto other = found.items().begin();
  for (const auto& [key, value] : expected.items()) {
    if (other.key() != key) return false;
    const bool same = holdsDoubles(expected.at("call").get<std::string>(), key)
                          ? near(value, other.value())
                          : value.dump() == other.value().dump();
    if (!same) return false;
    ++other;
  }
  return true;
}

std::vector<std::string> linesOf(const std::string& text) {
  std::vector<std::string> lines;
  std::istringstream stream(text);
  for (std::string line; std::getline(stream, line);) lines.push_back(line);
  return lines;
}

class GoldenTrace : public testing::TestWithParam<std::string> {};

TEST_P(GoldenTrace, IsWhatAnImportOfTheExampleCalls) {
  const std::string text = traceOfImport(GetParam());
  ASSERT_TRUE(text.ends_with("\n"));
  const std::vector<std::string> found = linesOf(text);
  const std::vector<std::string> expected = linesOf(contentsOf(goldenDir() / (GetParam() + ".trace")));
  for (std::size_t line = 0; line < std::min(expected.size(), found.size()); ++line) {
    ASSERT_TRUE(sameLine(expected[line], found[line]))
        << "line " << line + 1 << "\n  expected " << expected[line] << "\n  found    " << found[line];
  }
  EXPECT_EQ(found.size(), expected.size());
}

INSTANTIATE_TEST_SUITE_P(Examples, GoldenTrace, testing::ValuesIn(stemsIn(examplesDir(), ".ma")),
                         [](const auto& test) { return test.param; });

TEST(Examples, HaveOneGoldenTraceEach) {
  EXPECT_THAT(stemsIn(goldenDir(), ".trace"), testing::ContainerEq(stemsIn(examplesDir(), ".ma")));
}

TEST(Examples, ThatAreRefusedAskForABake) {
  std::set<std::string> refused;
  for (const std::string& stem : stemsIn(goldenDir(), ".trace")) {
    if (imports(contentsOf(goldenDir() / (stem + ".trace")))) continue;
    refused.insert(stem);
    EXPECT_NE(openingComment(contentsOf(examplesDir() / (stem + ".ma"))).find(" --bake"), std::string::npos)
        << stem;
  }
  EXPECT_EQ(refused, std::set<std::string>{"harbour_walk"});
}

TEST(Examples, BeginWithACommentThatSaysWhatTheyShow) {
  for (const std::string& stem : stemsIn(examplesDir(), ".ma")) {
    const std::vector<std::string> comment =
        linesOf(openingComment(contentsOf(examplesDir() / (stem + ".ma"))));
    ASSERT_GE(comment.size(), 2u) << stem;
    EXPECT_EQ(comment[0], "//Maya ASCII 2024 scene") << stem;
    EXPECT_TRUE(comment[1].starts_with("// ")) << stem;
  }
}

TEST(Examples, AreSmallAndEndWithALineEnd) {
  constexpr std::size_t largest = 15 * 1024;
  for (const std::string& stem : stemsIn(examplesDir(), ".ma")) {
    const std::string scene = contentsOf(examplesDir() / (stem + ".ma"));
    EXPECT_LE(scene.size(), largest) << stem;
    EXPECT_TRUE(scene.ends_with("\n")) << stem;
  }
}

TEST(TraceComparison, TakesDoublesWithinTheToleranceAndNothingElse) {
  const std::string line = R"({"call":"SetStreamValue","pluginId":1,"value":[100,0,0,0],"error":0})";
  EXPECT_TRUE(
      sameLine(line, R"({"call":"SetStreamValue","pluginId":1,"value":[100.00000000009,0,0,0],"error":0})"));
  EXPECT_FALSE(
      sameLine(line, R"({"call":"SetStreamValue","pluginId":1,"value":[100.00000000011,0,0,0],"error":0})"));
  EXPECT_FALSE(sameLine(line, R"({"call":"SetStreamValue","pluginId":2,"value":[100,0,0,0],"error":0})"));
  EXPECT_FALSE(sameLine(line, R"({"call":"SetStreamValue","value":[100,0,0,0],"pluginId":1,"error":0})"));
  EXPECT_FALSE(sameLine(line, R"({"call":"SetStreamValue","pluginId":1,"value":[100,0,0,0],"error":null})"));
  EXPECT_FALSE(sameLine(line, R"({"call":"SetStreamValue","pluginId":1,"value":[100,0,0],"error":0})"));
}

}  // namespace

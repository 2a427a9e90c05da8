// The whole trace that the tool writes of each example and of each scene of tests/scenes is the one that the
// second reader predicts. Two golden traces hold the second reader itself to what was once read by eye.
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/wait.h>

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

#include "tests/secondreader/SecondReader.h"
#include "tests/support/LeftOut.h"
#include "tests/support/TemporaryFolder.h"

namespace {

namespace fs = std::filesystem;
using secondreader::PredictedLine;
using secondreader::Prediction;

constexpr char kLinearUnits[] = "--linear-units 1";

fs::path sourceDir() { return MAYASCENE_SOURCE_DIR; }
fs::path goldenTrace(const std::string& stem) {
  return sourceDir() / "tests" / "examples" / "golden" / (stem + ".trace");
}

// The folder's scenes as the tool is given them: from the source folder on.
std::vector<std::string> scenesOf(const fs::path& folder, const std::string& lead = "") {
  std::vector<std::string> scenes;
  if (!fs::exists(sourceDir() / folder)) return scenes;
  for (const fs::directory_entry& entry : fs::directory_iterator(sourceDir() / folder)) {
    const fs::path name = entry.path().filename();
    if (name.extension() == ".ma" && name.string().starts_with(lead))
      scenes.push_back((folder / name).string());
  }
  std::sort(scenes.begin(), scenes.end());
  return scenes;
}

std::vector<std::string> ownScenes() {
  std::vector<std::string> all;
  for (const char* folder : {"examples", "tests/scenes/hazards", "tests/scenes/production"}) {
    const std::vector<std::string> scenes = scenesOf(folder);
    EXPECT_FALSE(scenes.empty()) << folder;
    all.insert(all.end(), scenes.begin(), scenes.end());
  }
  return all;
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

bool asksForUnits(const std::string& scene) {
  return openingComment(contentsOf(sourceDir() / scene)).find(kLinearUnits) != std::string::npos;
}

// Of a run of the tool, which imports without a header test before.
Prediction predicted(const std::string& scene) {
  refhost::HostOptions options;
  options.pluginId = 1;
  if (asksForUnits(scene)) options.linearUnits = 1;
  Prediction prediction = secondreader::predict(options, scene, contentsOf(sourceDir() / scene));
  std::vector<PredictedLine>& lines = prediction.trace;
  const auto at = [&lines](const char* word) {
    const std::string lead = std::string("{\"call\":\"") + word + "\",\"callback\":\"VerifyFileCallback\"";
    return std::find_if(lines.begin(), lines.end(),
                        [&](const auto& line) { return line.text.starts_with(lead); });
  };
  lines.erase(at("enter"), at("leave") + 1);
  return prediction;
}

std::string quoted(const fs::path& path) { return "'" + path.string() + "'"; }

struct ToolRun {
  int status = 0;
  std::string trace;
};

ToolRun importByTool(const std::string& scene) {
  const testsupport::TemporaryFolder scratch;
  std::string command = "cd " + quoted(sourceDir()) + " && " + quoted(MAYASCENE_TOOL) +
                        " import --quiet --preferences " + quoted(scratch.path() / "preferences") +
                        " --trace " + quoted(scratch.path() / "trace");
  if (asksForUnits(scene)) command += std::string(" ") + kLinearUnits;
  const int status = std::system((command + " " + quoted(fs::path(scene)) + " 2>/dev/null").c_str());
  return {WEXITSTATUS(status), scratch.read("trace")};
}

void expectTrace(const std::vector<PredictedLine>& predicted, const std::string& trace) {
  EXPECT_TRUE(trace.ends_with("\n"));
  const auto difference = firstDifference(predicted, secondreader::linesOf(trace));
  if (!difference) return;
  ADD_FAILURE() << "line " << difference->line << "\n  predicted " << difference->predicted
                << "\n  found     " << difference->traced;
}

void expectAsPredicted(const std::string& scene) {
  SCOPED_TRACE(scene);
  const Prediction prediction = predicted(scene);
  const ToolRun run = importByTool(scene);
  EXPECT_EQ(run.status, prediction.imports.front().code == 0 ? 0 : 1);
  expectTrace(prediction.trace, run.trace);
}

class TraceOfTheTool : public testing::TestWithParam<std::string> {};

TEST_P(TraceOfTheTool, IsTheOneThatTheSecondReaderPredicts) { expectAsPredicted(GetParam()); }

INSTANTIATE_TEST_SUITE_P(Scenes, TraceOfTheTool, testing::ValuesIn(ownScenes()), [](const auto& test) {
  return fs::path(test.param).parent_path().filename().string() + "_" + fs::path(test.param).stem().string();
});

// Scenes of others, where they lie beside the source folder.
TEST(TraceOfTheToolTest, IsTheOneThatTheSecondReaderPredictsForScenesOfOthers) {
  std::size_t leftOut = 13 + 27;
  for (const auto& [folder, lead] :
       {std::pair{"../shared/scenes", ""}, std::pair{"../shared/hazards", "h"}}) {
    for (const std::string& scene : scenesOf(folder, lead)) {
      expectAsPredicted(scene);
      --leftOut;
    }
  }
  if (leftOut != 0) {
    GTEST_SKIP() << testsupport::kLeftOut << "the traces of " << leftOut
                 << " scenes of ../shared, beside the source folder";
  }
}

class GoldenTrace : public testing::TestWithParam<const char*> {};

// The tool's trace agrees with the same prediction: a golden trace cannot be renewed into something wrong.
TEST_P(GoldenTrace, IsTheOneThatTheSecondReaderPredicts) {
  const std::string scene = std::string("examples/") + GetParam() + ".ma";
  expectTrace(predicted(scene).trace, contentsOf(goldenTrace(GetParam())));
}

TEST_P(GoldenTrace, IsWhatAnImportOfTheExampleCalls) {
  const std::string scene = std::string("examples/") + GetParam() + ".ma";
  std::vector<PredictedLine> lines = predicted(scene).trace;
  const std::vector<std::string> golden = secondreader::linesOf(contentsOf(goldenTrace(GetParam())));
  lines.resize(golden.size());
  for (std::size_t line = 0; line < golden.size(); ++line) lines[line].text = golden[line];
  expectTrace(lines, importByTool(scene).trace);
}

INSTANTIATE_TEST_SUITE_P(Examples, GoldenTrace, testing::Values("dolly_zoom", "look_at_dancer"),
                         [](const auto& test) { return std::string(test.param); });

TEST(Examples, ThatAreRefusedAskForABake) {
  std::vector<std::string> refused;
  for (const std::string& scene : scenesOf("examples")) {
    if (predicted(scene).imports.front().code == 0) continue;
    refused.push_back(scene);
    EXPECT_NE(openingComment(contentsOf(sourceDir() / scene)).find(" --bake"), std::string::npos) << scene;
  }
  EXPECT_THAT(refused, testing::ElementsAre("examples/harbour_walk.ma"));
}

TEST(Examples, BeginWithACommentThatSaysWhatTheyShow) {
  for (const std::string& scene : scenesOf("examples")) {
    const auto comment = secondreader::linesOf(openingComment(contentsOf(sourceDir() / scene)));
    ASSERT_GE(comment.size(), 2u) << scene;
    EXPECT_EQ(comment[0], "//Maya ASCII 2024 scene") << scene;
    EXPECT_TRUE(comment[1].starts_with("// ")) << scene;
  }
}

TEST(Examples, AreSmallAndEndWithALineEnd) {
  constexpr std::size_t largest = 15 * 1024;
  for (const std::string& scene : scenesOf("examples")) {
    const std::string text = contentsOf(sourceDir() / scene);
    EXPECT_LE(text.size(), largest) << scene;
    EXPECT_TRUE(text.ends_with("\n")) << scene;
  }
}

}  // namespace

// Every small scene cut at every byte, and with every byte replaced: the second reader predicts the result,
// and nothing is left behind.
#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <string>
#include <vector>

#include "tests/secondreader/SceneRun.h"
#include "tests/secondreader/SmallScenes.h"
#include "tests/support/WideTests.h"

namespace secondreader {
namespace {

// Of the replaced bytes every such one is tried, and of the cuts of the examples. Eleven bytes stand in the
// place of each, so each of these is tried at some places.
const std::size_t kStride = testsupport::HowMany({.quick = 5, .wide = 1, .sanitized = 5});
constexpr std::size_t kSmallExamples = 2;  // so many of the examples are cut too, the smallest

refhost::HostOptions options() {
  refhost::HostOptions options;
  options.pluginId = 7;
  options.linearUnits = 1;
  return options;
}

class SmallSceneTest : public ::testing::TestWithParam<SmallScene> {
 protected:
  // False after a disagreement.
  bool agrees(std::string_view scene, const std::string& what) {
    const RunReport report = runner_.run(options(), "scene.ma", scene);
    EXPECT_FALSE(report.prediction.processEnds);
    if (!report.disagreement) return true;
    ADD_FAILURE() << what << '\n' << *report.disagreement << "the scene:\n" << scene;
    return false;
  }

  SceneRunner runner_;
};

TEST_P(SmallSceneTest, ImportsWholeAsPredicted) {
  const RunReport report = runner_.run(options(), "scene.ma", GetParam().text);
  EXPECT_EQ(report.disagreement, std::nullopt);
  EXPECT_EQ(report.prediction.imports.front().code, 0);
  EXPECT_TRUE(report.prediction.verify.canImport);
}

TEST_P(SmallSceneTest, CutAtEveryByteGivesThePredictedTrace) {
  const std::string_view scene = GetParam().text;
  for (std::size_t length = 0; length <= scene.size(); ++length) {
    if (!agrees(scene.substr(0, length), "cut to " + std::to_string(length) + " bytes")) return;
  }
}

TEST_P(SmallSceneTest, EveryByteReplacedGivesThePredictedTrace) {
  constexpr std::string_view kBytes("\0\xff\";\\*/-\n", 9);
  std::string scene(GetParam().text);
  std::size_t patch = 0;
  for (std::size_t place = 0; place < scene.size(); ++place) {
    const char original = scene[place];
    std::string bytes(kBytes);
    bytes += static_cast<char>(original + 1);
    bytes += static_cast<char>(original - 1);
    for (const char byte : bytes) {
      if (patch++ % kStride != 0) continue;
      scene[place] = byte;
      const int value = static_cast<unsigned char>(byte);
      if (!agrees(scene, "byte " + std::to_string(place) + " is " + std::to_string(value))) return;
    }
    scene[place] = original;
  }
}

INSTANTIATE_TEST_SUITE_P(Scenes, SmallSceneTest, ::testing::ValuesIn(smallScenes()),
                         [](const auto& scene) { return std::string(scene.param.name); });

std::vector<std::filesystem::path> smallestExamples() {
  std::vector<std::filesystem::path> paths;
  for (const auto& entry : std::filesystem::directory_iterator(MAYASCENE_SOURCE_DIR "/examples")) {
    if (entry.path().extension() == ".ma") paths.push_back(entry.path());
  }
  std::sort(paths.begin(), paths.end(), [](const auto& a, const auto& b) {
    return std::filesystem::file_size(a) < std::filesystem::file_size(b);
  });
  paths.resize(std::min(paths.size(), kSmallExamples));
  return paths;
}

TEST(ExampleCutsTest, ExamplesCutAtEveryByteGiveThePredictedTrace) {
  SceneRunner runner;
  const auto paths = smallestExamples();
  ASSERT_EQ(paths.size(), kSmallExamples);
  for (const std::filesystem::path& path : paths) {
    std::ostringstream read;
    read << std::ifstream(path, std::ios::binary).rdbuf();
    const std::string scene = read.str();
    for (std::size_t length = 0; length <= scene.size(); length += kStride) {
      const RunReport report = runner.run(options(), "scene.ma", std::string_view(scene).substr(0, length));
      ASSERT_EQ(report.disagreement, std::nullopt) << path << " cut to " << length << " bytes";
    }
  }
}

}  // namespace
}  // namespace secondreader

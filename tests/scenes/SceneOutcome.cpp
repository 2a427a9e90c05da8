#include "tests/scenes/SceneOutcome.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <ostream>

#include "hostapi/ErrorCodes.h"
#include "tests/scenes/ImportedScene.h"

namespace scenes {

using refhost::LayerKind;
using testing::ElementsAreArray;
using testing::IsEmpty;

void PrintTo(const SceneOutcome& outcome, std::ostream* out) { *out << outcome.name; }

std::string nameOf(const SceneOutcome& outcome) { return outcome.name; }

std::vector<std::string> messagesOf(HostError code) {
  if (code == HOST_ERR_MAYA_SYNTAX) return {"Error reading Maya file."};
  if (code == HOST_ERR_MAYA_UNEXPECTED_END) return {"Unexpected end of maya file."};
  if (code == HOST_ERR_MAYA_KEY_COUNTS) return {"Inconsistant number of keyframes for Maya camera."};
  return {};
}

void expectOutcome(const std::filesystem::path& folder, const SceneOutcome& outcome) {
  ImportedScene scene(folder / (std::string(outcome.name) + ".ma"));
  ASSERT_TRUE(scene.loaded());
  EXPECT_EQ(scene.result().code, outcome.code);
  EXPECT_EQ(scene.compositions(), outcome.compositions);
  EXPECT_THAT(scene.names(LayerKind::Camera), ElementsAreArray(outcome.cameras));
  EXPECT_THAT(scene.names(LayerKind::Null), ElementsAreArray(outcome.nulls));
  EXPECT_EQ(scene.keys(), outcome.keys);
  EXPECT_EQ(scene.aimedCameras(), outcome.aimed);
  EXPECT_THAT(scene.result().messages, ElementsAreArray(messagesOf(outcome.code)));
  EXPECT_THAT(scene.result().refusals, IsEmpty());
  EXPECT_TRUE(scene.result().ledgerClean());
  EXPECT_TRUE(scene.unload().ledgerClean());
}

std::vector<std::string> scenesIn(const std::filesystem::path& folder) {
  std::vector<std::string> scenes;
  for (const auto& entry : std::filesystem::directory_iterator(folder)) {
    if (entry.path().extension() == ".ma") scenes.push_back(entry.path().stem().string());
  }
  std::sort(scenes.begin(), scenes.end());
  return scenes;
}

std::filesystem::path ownFolder(const char* folder) {
  return std::filesystem::path(MAYASCENE_SOURCE_DIR) / "tests" / "scenes" / folder;
}

}  // namespace scenes

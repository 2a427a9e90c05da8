// Scenes as they come out of production: what an import of each gives.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <set>
#include <string>
#include <vector>

#include "hostapi/ErrorCodes.h"
#include "tests/scenes/ImportedScene.h"

namespace {

using refhost::LayerKind;
using scenes::ImportedScene;
using scenes::sharedFolder;
using testing::ElementsAre;
using testing::IsEmpty;

constexpr char kSyntax[] = "Error reading Maya file.";
constexpr char kUnexpectedEnd[] = "Unexpected end of maya file.";
constexpr char kKeyCounts[] = "Inconsistant number of keyframes for Maya camera.";

struct Outcome {
  const char* name;
  std::size_t compositions;
  std::size_t cameras;
  std::size_t nulls;
  std::size_t keys;
  std::size_t aimed = 0;
  HostError code = 0;
  const char* message = nullptr;
};

void PrintTo(const Outcome& outcome, std::ostream* out) { *out << outcome.name; }

constexpr Outcome kOutcomes[] = {
    {.name = "tracked_camera", .compositions = 1, .cameras = 1, .nulls = 0, .keys = 570},
    {.name = "animated_camera", .compositions = 1, .cameras = 1, .nulls = 0, .keys = 12},
    {.name = "camera_export_pal", .compositions = 2, .cameras = 1, .nulls = 5, .keys = 10},
    {.name = "five_cameras", .compositions = 1, .cameras = 5, .nulls = 11, .keys = 27},
    {.name = "lookat_short_names", .compositions = 1, .cameras = 1, .nulls = 1, .keys = 10},
    {.name = "lookat_full_names", .compositions = 2, .cameras = 1, .nulls = 1, .keys = 0, .aimed = 1},
    {.name = "camera_rig_aim", .compositions = 1, .cameras = 1, .nulls = 0, .keys = 0},
    {.name = "stereo_rigs", .compositions = 1, .cameras = 7, .nulls = 4, .keys = 0},
    {.name = "inch_40fps", .compositions = 1, .cameras = 0, .nulls = 0, .keys = 0},
    {.name = "unequal_keys",
     .compositions = 1,
     .cameras = 3,
     .nulls = 0,
     .keys = 25,
     .code = HOST_ERR_MAYA_KEY_COUNTS,
     .message = kKeyCounts},
    {.name = "attribute_alias",
     .compositions = 0,
     .cameras = 0,
     .nulls = 0,
     .keys = 0,
     .code = HOST_ERR_MAYA_SYNTAX,
     .message = kSyntax},
    {.name = "unquoted_path",
     .compositions = 0,
     .cameras = 0,
     .nulls = 0,
     .keys = 0,
     .code = HOST_ERR_MAYA_SYNTAX,
     .message = kSyntax},
    {.name = "no_final_newline",
     .compositions = 0,
     .cameras = 0,
     .nulls = 0,
     .keys = 0,
     .code = HOST_ERR_MAYA_UNEXPECTED_END,
     .message = kUnexpectedEnd},
};

class SharedScene : public testing::TestWithParam<Outcome> {
 protected:
  void SetUp() override {
    if (!std::filesystem::exists(sharedFolder("scenes")))
      GTEST_SKIP() << "no scenes beside the source folder";
  }
};

TEST_P(SharedScene, GivesWhatItIsKnownToGive) {
  const Outcome& expected = GetParam();
  ImportedScene scene(sharedFolder("scenes") / (std::string(expected.name) + ".ma"));
  ASSERT_TRUE(scene.loaded());
  EXPECT_EQ(scene.result().code, expected.code);
  EXPECT_EQ(scene.compositions(), expected.compositions);
  EXPECT_EQ(scene.layers(LayerKind::Camera), expected.cameras);
  EXPECT_EQ(scene.layers(LayerKind::Null), expected.nulls);
  EXPECT_EQ(scene.keys(), expected.keys);
  EXPECT_EQ(scene.aimedCameras(), expected.aimed);
  if (expected.message == nullptr) {
    EXPECT_THAT(scene.result().messages, IsEmpty());
  } else {
    EXPECT_THAT(scene.result().messages, ElementsAre(expected.message));
  }
  EXPECT_THAT(scene.result().refusals, IsEmpty());
  EXPECT_TRUE(scene.result().ledgerClean());
  EXPECT_TRUE(scene.unload().ledgerClean());
}

INSTANTIATE_TEST_SUITE_P(All, SharedScene, testing::ValuesIn(kOutcomes),
                         [](const auto& test) { return std::string(test.param.name); });

TEST(SharedScenes, AreAllKnown) {
  if (!std::filesystem::exists(sharedFolder("scenes"))) GTEST_SKIP() << "no scenes beside the source folder";
  std::set<std::string> known, there;
  for (const Outcome& outcome : kOutcomes) known.insert(outcome.name);
  for (const auto& entry : std::filesystem::directory_iterator(sharedFolder("scenes"))) {
    if (entry.path().extension() == ".ma") there.insert(entry.path().stem().string());
  }
  EXPECT_THAT(there, testing::ContainerEq(known));
}

}  // namespace

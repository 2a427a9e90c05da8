// Scenes as they come out of production, each for what it shows: what an import of each gives.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "hostapi/ErrorCodes.h"
#include "hostapi/LayerStreams.h"
#include "tests/scenes/ImportedScene.h"
#include "tests/scenes/SceneOutcome.h"

namespace {

using scenes::ImportedScene;
using scenes::ownFolder;
using scenes::SceneOutcome;
using testing::ElementsAre;
using testing::UnorderedElementsAreArray;

std::filesystem::path production(const char* name) {
  return ownFolder("production") / (std::string(name) + ".ma");
}

const std::vector<SceneOutcome>& outcomes() {
  static const std::vector<SceneOutcome> all = {
      {.name = "tracked_camera", .compositions = 1, .cameras = {"solveShape"}, .keys = 54},
      {.name = "lens_and_camera_keyed_apart", .compositions = 1, .cameras = {"zoomerShape"}, .keys = 12},
      {.name = "six_parents_and_no_pixel_aspect",
       .compositions = 2,
       .cameras = {"takeShape"},
       .nulls = {"dolly", "group", "master", "rig", "tilt"},
       .keys = 10},
      {.name = "cameras_of_every_kind",
       .compositions = 1,
       .cameras = {"checkedShape", "focusedShape", "stillShape", "walkingShape", "zoomingShape"},
       .nulls = {"cameras", "cameras", "cameras", "cameras", "cameras"},
       .keys = 19},
      {.name = "look_at_in_short_names",
       .compositions = 1,
       .cameras = {"watchShape"},
       .nulls = {"stage"},
       .keys = 10},
      {.name = "look_at_in_full_names",
       .compositions = 2,
       .cameras = {"watchShape"},
       .nulls = {"stage"},
       .aimed = 1},
      {.name = "camera_held_by_three_constraints", .compositions = 1, .cameras = {"render_camShape"}},
      {.name = "two_stereo_rigs",
       .compositions = 1,
       .cameras = {"domeCenterShape", "domeLeftShape", "domeRightShape", "hallCenterShape", "hallLeftShape",
                   "hallRightShape", "perspShape2"},
       .nulls = {"dome", "dome", "hall", "hall"}},
      {.name = "inches_and_a_rate_in_a_word", .compositions = 1},
      {.name = "channels_of_unequal_key_counts",
       .code = HOST_ERR_MAYA_KEY_COUNTS,
       .compositions = 1,
       .cameras = {"firstShape", "secondShape", "thirdShape"},
       .keys = 25},
      {.name = "alias_list_in_braces", .code = HOST_ERR_MAYA_SYNTAX},
      {.name = "path_without_quotes", .code = HOST_ERR_MAYA_SYNTAX},
      {.name = "last_comment_without_a_line_end", .code = HOST_ERR_MAYA_UNEXPECTED_END},
  };
  return all;
}

class ProductionScene : public testing::TestWithParam<SceneOutcome> {};

TEST_P(ProductionScene, GivesWhatItIsKnownToGive) {
  scenes::expectOutcome(ownFolder("production"), GetParam());
}

INSTANTIATE_TEST_SUITE_P(All, ProductionScene, testing::ValuesIn(outcomes()),
                         [](const auto& test) { return scenes::nameOf(test.param); });

TEST(ProductionScenes, AreAllImported) {
  std::vector<std::string> known;
  for (const SceneOutcome& outcome : outcomes()) known.push_back(outcome.name);
  EXPECT_THAT(scenes::scenesIn(ownFolder("production")), UnorderedElementsAreArray(known));
}

TEST(ProductionScenes, LensAndCameraKeepEachItsOwnKeys) {
  ImportedScene scene(production("lens_and_camera_keyed_apart"));
  ASSERT_TRUE(scene.loaded());
  const refhost::Layer* camera = scene.layer("zoomerShape");
  ASSERT_NE(camera, nullptr);
  const refhost::KeyTimes& zoom = camera->findStream(HOST_STREAM_ZOOM)->keys->times;
  const refhost::KeyTimes& position = camera->findStream(HOST_STREAM_POSITION)->keys->times;
  constexpr int kFrame = 1000;  // of a scale of 24000; each counts from its own first
  EXPECT_EQ(zoom[1].value, (100 - 1) * kFrame);
  EXPECT_EQ(zoom[1].scale, 24u * kFrame);
  EXPECT_EQ(position[1].value, (100 - 11) * kFrame);
}

TEST(ProductionScenes, TheParentsHangUnderEachOtherInOrder) {
  ImportedScene scene(production("six_parents_and_no_pixel_aspect"));
  ASSERT_TRUE(scene.loaded());
  const refhost::Layer* layer = scene.layer("takeShape");
  ASSERT_NE(layer, nullptr);
  std::vector<std::string> parents;
  while ((layer = layer->parent) != nullptr) parents.push_back(layer->name);
  EXPECT_THAT(parents, ElementsAre("group", "tilt", "dolly", "rig", "master"));
  EXPECT_EQ(scene.layer("dolly")->findStream(HOST_STREAM_POSITION)->keyCount(), 2u);
}

TEST(ProductionScenes, TheLookAtInFullNamesMovesThePointOfInterest) {
  ImportedScene scene(production("look_at_in_full_names"));
  ASSERT_TRUE(scene.loaded());
  const refhost::Layer* camera = scene.layer("watchShape");
  ASSERT_NE(camera, nullptr);
  EXPECT_THAT(camera->findStream(HOST_STREAM_ANCHOR_POINT)->value, ElementsAre(5.0, -6.0, 7.0));
}

TEST(ProductionScenes, ARateInAWordIsTheCompositions) {
  ImportedScene scene(production("inches_and_a_rate_in_a_word"));
  ASSERT_TRUE(scene.loaded());
  ASSERT_EQ(scene.compositions(), 1u);
  EXPECT_EQ(scene.project().compositions()[0].frameRate.numerator, 40000);
  EXPECT_EQ(scene.project().compositions()[0].frameRate.denominator, 1000u);
}

}  // namespace

// Scenes made to do harm, one hazard each: each returns, with the code that its text deserves, and leaves
// nothing behind.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <vector>

#include "hostapi/ErrorCodes.h"
#include "hostapi/LayerStreams.h"
#include "tests/scenes/ImportedScene.h"
#include "tests/scenes/SceneOutcome.h"
#include "tests/support/TemporaryFolder.h"

namespace {

using refhost::LayerKind;
using scenes::ImportedScene;
using scenes::ownFolder;
using scenes::SceneOutcome;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::UnorderedElementsAreArray;

std::filesystem::path hazard(const char* name) { return ownFolder("hazards") / (std::string(name) + ".ma"); }

const std::vector<SceneOutcome>& hazards() {
  // The pixels of a scene that says nothing of them are not square, so a scene with a camera makes two
  // compositions.
  static const std::vector<SceneOutcome> all = {
      // The text ends too soon, or where it may.
      {.name = "word_runs_into_the_end", .code = HOST_ERR_MAYA_UNEXPECTED_END},
      {.name = "node_creation_runs_into_the_end", .code = HOST_ERR_MAYA_UNEXPECTED_END},
      {.name = "select_runs_into_the_end", .code = HOST_ERR_MAYA_UNEXPECTED_END},
      {.name = "connection_runs_into_the_end", .code = HOST_ERR_MAYA_UNEXPECTED_END},
      {.name = "value_runs_into_the_end", .code = HOST_ERR_MAYA_UNEXPECTED_END},
      {.name = "comment_open_after_a_star", .code = HOST_ERR_MAYA_UNEXPECTED_END},
      {.name = "string_stays_open", .code = HOST_ERR_MAYA_UNEXPECTED_END},
      {.name = "node_type_is_missing_at_the_end", .compositions = 2, .cameras = {"kept"}},
      // Bytes that no scene should have.
      {.name = "nul_inside_a_word", .compositions = 2, .cameras = {"afterNul"}},
      {.name = "nul_between_commands", .compositions = 2, .cameras = {"before"}},
      {.name = "byte_that_is_no_ascii", .code = HOST_ERR_MAYA_SYNTAX},
      // Who owns a curve's keys.
      {.name = "two_curves_of_one_name", .compositions = 2, .cameras = {"dollyShape"}, .keys = 15},
      {.name = "second_curve_of_a_name_has_no_keys", .compositions = 2, .cameras = {"dollyShape"}},
      {.name = "selection_between_keys", .compositions = 2, .cameras = {"dollyShape"}, .keys = 15},
      {.name = "curves_without_a_name", .compositions = 2, .cameras = {"beside"}},
      {.name = "curve_names_too_long_to_keep", .compositions = 2, .cameras = {"beside"}},
      {.name = "keys_before_a_bad_number", .code = HOST_ERR_NUMBER_SYNTAX},
      {.name = "keys_before_a_refused_byte", .code = HOST_ERR_MAYA_SYNTAX},
      // Parents in a circle.
      {.name = "transform_is_its_own_parent", .compositions = 2, .cameras = {"loopShape"}},
      {.name = "two_transforms_are_each_others_parents",
       .compositions = 2,
       .cameras = {"henShape"},
       .nulls = {"egg"}},
      {.name = "parent_and_child_of_one_name",
       .compositions = 2,
       .cameras = {"takeShape"},
       .nulls = {"crane"}},
      {.name = "marked_locator_under_a_circle",
       .compositions = 2,
       .cameras = {"eye"},
       .nulls = {"loop_nullShape"}},
      // Numbers out of range, too few of them, and a command that runs into the next.
      {.name = "width_beyond_every_integer", .compositions = 1, .cameras = {"wide"}},
      {.name = "key_time_beyond_the_range", .compositions = 2, .cameras = {"eye"}},
      {.name = "key_time_without_bound", .code = HOST_ERR_NUMBER_RANGE},
      {.name = "scale_of_one_number", .compositions = 2, .cameras = {"shortShape"}},
      {.name = "option_takes_the_semicolon", .compositions = 2, .cameras = {"read"}},
  };
  return all;
}

class HazardScene : public testing::TestWithParam<SceneOutcome> {};

TEST_P(HazardScene, ReturnsItsCodeAndLeavesNothingBehind) {
  scenes::expectOutcome(ownFolder("hazards"), GetParam());
}

INSTANTIATE_TEST_SUITE_P(All, HazardScene, testing::ValuesIn(hazards()),
                         [](const auto& test) { return scenes::nameOf(test.param); });

TEST(HazardScenes, AreAllImported) {
  std::vector<std::string> known;
  for (const SceneOutcome& outcome : hazards()) known.push_back(outcome.name);
  EXPECT_THAT(scenes::scenesIn(ownFolder("hazards")), UnorderedElementsAreArray(known));
}

TEST(HazardScenes, KeyTimesPastTheRangeAreHeldAtItsEnd) {
  ImportedScene scene(hazard("key_time_beyond_the_range"));
  ASSERT_TRUE(scene.loaded());
  ASSERT_EQ(scene.compositions(), 2u);
  EXPECT_EQ(scene.project().compositions()[0].duration.value, 2147483647);
  EXPECT_EQ(scene.project().compositions()[0].duration.scale, 1000u);
}

TEST(HazardScenes, WidthsPastTheRangeAreHeldAtItsEnd) {
  ImportedScene scene(hazard("width_beyond_every_integer"));
  ASSERT_TRUE(scene.loaded());
  ASSERT_EQ(scene.compositions(), 1u);
  EXPECT_EQ(scene.project().compositions()[0].width, 2147483647);
  EXPECT_EQ(scene.project().compositions()[0].height, 1080);
}

TEST(HazardScenes, OfTwoTransformsOfOneNameTheSecondIsPlaced) {
  ImportedScene scene(hazard("parent_and_child_of_one_name"));
  ASSERT_TRUE(scene.loaded());
  const refhost::Layer* crane = scene.layer("crane");
  ASSERT_NE(crane, nullptr);
  EXPECT_NEAR(crane->findStream(HOST_STREAM_POSITION)->value[2], -20.0, 1e-12);
  EXPECT_EQ(crane->parent, nullptr);
}

TEST(HazardScenes, NumbersThatAreMissingFromATripleAreThoseOfATransformAtRest) {
  ImportedScene scene(hazard("scale_of_one_number"));
  ASSERT_TRUE(scene.loaded());
  const refhost::Layer* camera = scene.layer("shortShape");
  ASSERT_NE(camera, nullptr);
  EXPECT_THAT(camera->findStream(HOST_STREAM_POSITION)->value, ElementsAre(2.0, 0.0, 0.0));
  EXPECT_THAT(camera->findStream(HOST_STREAM_SCALE)->value, ElementsAre(300.0, 100.0, 100.0));
}

// 85 KB of text ask for a million layers.
std::string chainAboveEachOfManyLocators() {
  std::string text =
      "//Maya ASCII 2024 scene\ncreateNode camera -n \"eye\";\ncreateNode transform -n \"link0\";\n";
  for (int link = 1; link < 1000; ++link) {
    const std::string above = std::to_string(link - 1);
    text += "createNode transform -n \"link" + std::to_string(link) + "\" -p \"link" + above + "\";\n";
  }
  for (int locator = 0; locator < 1000; ++locator) {
    text += "createNode locator -n \"null" + std::to_string(locator) + "\" -p \"link999\";\n";
  }
  return text;
}

TEST(HazardScenes, AThousandParentsAboveEachOfAThousandLocatorsAllBecomeNulls) {
  const testsupport::TemporaryFolder folder;
  ImportedScene scene(folder.write("chains.ma", chainAboveEachOfManyLocators()));
  ASSERT_TRUE(scene.loaded());
  EXPECT_EQ(scene.result().code, 0);
  EXPECT_TRUE(scene.result().ledgerClean());
  std::size_t locators = 0, parents = 0, tops = 0;
  for (const refhost::Layer& layer : scene.project().layers()) {
    if (layer.kind != LayerKind::Null) continue;
    ++(layer.name.starts_with("null") ? locators : parents);
    if (layer.parent == nullptr) ++tops;
  }
  EXPECT_EQ(scene.layers(LayerKind::Camera), 1u);
  EXPECT_EQ(locators, 1000u);
  EXPECT_EQ(parents, 999000u);
  EXPECT_EQ(tops, 1000u);
}

TEST(HazardScenes, ParentsWithoutEndAreRefusedAtTheLimitAndTheNullsBeforeStay) {
  constexpr std::int32_t kMost = 5000;
  refhost::HostOptions options;
  options.mostLayers = kMost;
  const testsupport::TemporaryFolder folder;
  ImportedScene scene(folder.write("chains.ma", chainAboveEachOfManyLocators()), options);
  ASSERT_TRUE(scene.loaded());
  EXPECT_EQ(scene.result().code, HOST_ERR_TOO_MANY_LAYERS);
  EXPECT_THAT(scene.result().refusals, ElementsAre("NewNullLayer: the host takes no more than 5000 layers"));
  EXPECT_THAT(scene.result().messages, IsEmpty());
  EXPECT_TRUE(scene.result().ledgerClean());
  EXPECT_EQ(scene.project().layers().size(), std::size_t{kMost});
  EXPECT_EQ(scene.layers(LayerKind::Camera), 1u);
}

}  // namespace

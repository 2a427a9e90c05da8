// Each example scene shows what its comment says.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

#include "hostapi/LayerStreams.h"
#include "tests/scenes/ImportedScene.h"
#include "tests/support/TemporaryFolder.h"

namespace {

using refhost::Composition;
using refhost::Layer;
using refhost::LayerKind;
using refhost::Stream;
using scenes::ImportedScene;
using testing::DoubleNear;
using testing::ElementsAre;

constexpr int kPointOfInterest = HOST_STREAM_ANCHOR_POINT;
constexpr int kPosition = HOST_STREAM_POSITION;
constexpr int kZRotation = HOST_STREAM_ROTATION_Z;
constexpr int kZoom = HOST_STREAM_ZOOM;
constexpr std::size_t kKeys = 24;  // of every animated channel

std::filesystem::path example(const char* name) {
  return std::filesystem::path(MAYASCENE_SOURCE_DIR) / "examples" / (std::string(name) + ".ma");
}

// One component of a stream at every key.
std::vector<double> keysOf(const Layer& layer, int stream, std::size_t component = 0) {
  const Stream& found = *layer.findStream(stream);
  std::vector<double> values;
  for (std::size_t key = 0; key < found.keyCount(); ++key) {
    values.push_back(found.keys->values[key * static_cast<std::size_t>(found.dimension) + component]);
  }
  return values;
}

std::vector<std::string> parentsOf(const Layer* layer) {
  std::vector<std::string> names;
  while ((layer = layer->parent) != nullptr) names.push_back(layer->name);
  return names;
}

TEST(CraneShot, HangsTheCameraUnderTheWholeCrane) {
  const ImportedScene scene(example("crane_shot"));
  ASSERT_TRUE(scene.loaded());
  const Layer* camera = scene.layer("shot_camShape");
  ASSERT_NE(camera, nullptr);
  EXPECT_THAT(parentsOf(camera),
              ElementsAre("crane_head", "crane_plate", "crane_arm", "crane_column", "crane_track"));
  EXPECT_EQ(camera->findStream(kPosition)->keyCount(), 0u);
  for (const Layer* part = camera->parent; part != nullptr; part = part->parent) {
    EXPECT_EQ(part->findStream(kPosition)->keyCount(), kKeys) << part->name;
  }
}

TEST(DollyZoom, KeepsTheActorsSize) {
  const ImportedScene scene(example("dolly_zoom"));
  ASSERT_TRUE(scene.loaded());
  const Layer* camera = scene.layer("vertigo_camShape");
  ASSERT_NE(camera, nullptr);
  const std::vector<double> zoom = keysOf(*camera, kZoom);
  const std::vector<double> depth = keysOf(*camera, kPosition, 2);  // the actor stands at the origin
  ASSERT_EQ(zoom.size(), kKeys);
  ASSERT_EQ(depth.size(), kKeys);
  constexpr double writtenDigits = 1e-7;
  for (std::size_t key = 1; key < kKeys; ++key) {
    EXPECT_NEAR(zoom[key] / depth[key], zoom[0] / depth[0], writtenDigits);
  }
  EXPECT_GT(zoom.back(), 4.0 * zoom.front());
}

TEST(AimedCamera, LooksAtTheMovingTarget) {
  const ImportedScene scene(example("aimed_camera"));
  ASSERT_TRUE(scene.loaded());
  const Layer* camera = scene.layer("chase_camShape");
  ASSERT_NE(camera, nullptr);
  EXPECT_TRUE(camera->aimed);
  const std::vector<double> across = keysOf(*camera, kPointOfInterest);
  ASSERT_EQ(across.size(), kKeys);
  EXPECT_THAT(keysOf(*camera, kZRotation), testing::Each(DoubleNear(0.0, 1e-12)));
  EXPECT_LT(across.front(), -600.0);
  EXPECT_GT(across.back(), 600.0);
}

// A weight that is connected after the target's translation names the constraint as a target too.
TEST(AimedCamera, WhoseWeightIsConnectedLastIsAimedAtTheConstraintItself) {
  std::ifstream file(example("aimed_camera"), std::ios::binary);
  std::string text{std::istreambuf_iterator<char>(file), {}};
  const std::size_t start = text.find("connectAttr \"chase_cam_aim.car_focusW0\"");
  ASSERT_NE(start, std::string::npos);
  const std::size_t length = text.find('\n', start) + 1 - start;
  const std::string weight = text.substr(start, length);
  text.erase(start, length);
  text.insert(text.find("// End of"), weight);

  const testsupport::TemporaryFolder folder;
  const ImportedScene scene(folder.write("weight_last.ma", text));

  ASSERT_TRUE(scene.loaded());
  const Layer* camera = scene.layer("chase_camShape");
  ASSERT_NE(camera, nullptr);
  EXPECT_TRUE(camera->aimed);
  EXPECT_EQ(camera->findStream(kPointOfInterest)->keyCount(), 0u);
  EXPECT_THAT(camera->findStream(kPointOfInterest)->value, testing::Each(DoubleNear(0.0, 1e-12)));
}

TEST(StereoPair, SetsTheEyesApartUnderOneMovingRig) {
  const ImportedScene scene(example("stereo_pair"));
  ASSERT_TRUE(scene.loaded());
  EXPECT_EQ(scene.layers(LayerKind::Camera), 3u);
  const Layer* left = scene.layer("window_rigLeftShape");
  const Layer* right = scene.layer("window_rigRightShape");
  ASSERT_NE(left, nullptr);
  ASSERT_NE(right, nullptr);
  EXPECT_NEAR(right->findStream(kPosition)->value[0] - left->findStream(kPosition)->value[0], 6.5, 1e-12);
  for (const Layer* eye : {left, right}) {
    EXPECT_THAT(parentsOf(eye), ElementsAre("window_rig"));
    EXPECT_EQ(eye->parent->findStream(kPosition)->keyCount(), kKeys);
  }
}

TEST(AnamorphicPan, NestsASquareCompositionInThePlates) {
  const ImportedScene scene(example("anamorphic_pan"));
  ASSERT_TRUE(scene.loaded());
  ASSERT_EQ(scene.compositions(), 2u);
  const Composition& square = scene.project().compositions()[0];
  const Composition& plate = scene.project().compositions()[1];
  EXPECT_EQ(square.name, "Square anamorphic_pan");
  EXPECT_EQ(square.width, 3656);
  EXPECT_EQ(square.height, 1556);
  EXPECT_EQ(plate.name, "anamorphic_pan");
  EXPECT_EQ(plate.width, 1828);
  EXPECT_EQ(plate.height, 1556);
  EXPECT_EQ(plate.pixelAspect.numerator, 2000);
  EXPECT_EQ(plate.pixelAspect.denominator, 1000u);
  ASSERT_EQ(plate.layers.size(), 1u);
  EXPECT_EQ(plate.layers[0]->source, &square);
}

TEST(TrackedMarkers, KeepsTheMarkedPointsAndLeavesTheRest) {
  const ImportedScene scene(example("tracked_markers"));
  ASSERT_TRUE(scene.loaded());
  EXPECT_THAT(scene.names(LayerKind::Null),
              testing::UnorderedElementsAre("null_doorLeftShape", "null_doorRightShape", "lamp_NULLShape",
                                            "signNullShape"));
  const Layer* camera = scene.layer("solved_camShape");
  ASSERT_NE(camera, nullptr);
  ASSERT_EQ(camera->findStream(kPosition)->keyCount(), kKeys);
  EXPECT_EQ(camera->findStream(kPosition)->keys->times[0].value, 0);  // frame 1001
}

// Where the bottle of the tabletop lies on its plate.
std::vector<double> bottlePosition(bool linearUnits) {
  const ImportedScene scene(example("tabletop_centimeters"), linearUnits);
  const Layer* bottle = scene.loaded() ? scene.layer("null_bottleShape") : nullptr;
  if (bottle == nullptr) return {};
  const Stream& position = *bottle->findStream(kPosition);
  return {position.value[0], position.value[1], position.value[2]};
}

TEST(TabletopCentimeters, IsMeasuredInPointsWithLinearUnits) {
  EXPECT_THAT(bottlePosition(true),
              ElementsAre(DoubleNear(360.0, 1e-9), DoubleNear(-720.0, 1e-9), DoubleNear(216.0, 1e-9)));
}

TEST(TabletopCentimeters, IsMeasuredAsItStandsWithoutLinearUnits) {
  EXPECT_THAT(bottlePosition(false),
              ElementsAre(DoubleNear(12.7, 1e-12), DoubleNear(-25.4, 1e-12), DoubleNear(7.62, 1e-12)));
}

TEST(BigWheel, TurnsOnPastAFullTurn) {
  const ImportedScene scene(example("big_wheel"));
  ASSERT_TRUE(scene.loaded());
  const Layer* null = scene.layer("gondola_nullShape");
  ASSERT_NE(null, nullptr);
  EXPECT_THAT(parentsOf(null), ElementsAre("gondola", "wheel"));
  const std::vector<double> turn = keysOf(*null->parent->parent, kZRotation);
  ASSERT_EQ(turn.size(), kKeys);
  EXPECT_TRUE(std::is_sorted(turn.begin(), turn.end()));
  EXPECT_NEAR(turn.back(), 540.0, 1e-6);
  const Layer* camera = scene.layer("fair_camShape");
  ASSERT_NE(camera, nullptr);
  EXPECT_EQ(camera->filmDirection, 2);
}

}  // namespace

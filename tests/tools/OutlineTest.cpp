#include "tools/mayascene/Outline.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <cstdint>
#include <memory>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

#include "hostapi/LayerStreams.h"
#include "tests/tools/HandBuiltScene.h"

namespace mayascene {
namespace {

using mayascene_test::HandBuiltScene;
using ::testing::HasSubstr;

std::string outlineOf(const SceneReport& report, Detail detail = Detail::Properties) {
  std::ostringstream out;
  printOutline(out, report, detail, Style(false));
  return out.str();
}

bool contains(const std::string& text, const std::string& part) {
  return text.find(part) != std::string::npos;
}

TEST(Outline, InShortALayerIsALineWithItsLensAndWhatIsAnimatedWhen) {
  HandBuiltScene scene;
  EXPECT_EQ(outlineOf(scene.report, Detail::Layers),
            "shots/crane.ma: 1 composition, 1 camera, 2 nulls, 4 keys\n"
            "\n"
            "\"crane\"   1920 x 1080 px, pixel aspect 1, 24 fps, 2 s (48 frames)\n"
            "  null \"base\"   still\n"
            "    null \"arm\"   position animated, frames 0 to 47\n"
            "      camera \"shotcamShape\", aimed at its point of interest   lens 24.7 mm   still\n");
}

TEST(Outline, InShortKeysOfOneValueAreStillAndTheWidestSpanOfFramesIsShown) {
  HandBuiltScene scene;
  refhost::Layer& camera = scene.layers[0];
  camera.filmDirection = refhost::kFilmNeverSet;
  const auto animate = [&](std::int32_t id, std::vector<T_Time> times, std::vector<double> values) {
    const auto stream = std::find_if(camera.streams.begin(), camera.streams.end(),
                                     [id](const refhost::Stream& one) { return one.id == id; });
    ASSERT_NE(stream, camera.streams.end());
    stream->keys = std::make_unique<refhost::KeyColumns>();
    stream->keys->times = refhost::KeyTimes(std::move(times));
    stream->keys->values = std::move(values);
  };
  animate(HOST_STREAM_ZOOM, {{3000, 24000}, {4000, 24000}, {5000, 24000}}, {700, 800, 640});
  animate(HOST_STREAM_ROTATION_X, {{1, 24}, {7, 24}}, {1, 2});
  animate(HOST_STREAM_ROTATION_Z, {{2, 24}, {11, 24}}, {3, 4});
  animate(HOST_STREAM_ROTATION_Y, {{0, 24}, {40, 24}}, {5, 5});
  animate(HOST_STREAM_ANCHOR_POINT, {{6, 24}, {8, 24}}, {0, 0, 0, 0, 0, 9});
  EXPECT_THAT(
      outlineOf(scene.report, Detail::Layers),
      HasSubstr("   zoom 640 to 800 px   zoom, rotation, point of interest animated, frames 1 to 11\n"));
}

TEST(Outline, LayersFormATreeOfParentsWithValuesAndKeys) {
  const HandBuiltScene scene;
  EXPECT_EQ(outlineOf(scene.report),
            "shots/crane.ma: 1 composition, 1 camera, 2 nulls, 4 keys\n"
            "\n"
            "\"crane\"   1920 x 1080 px, pixel aspect 1, 24 fps, 2 s (48 frames)\n"
            "  null \"base\"\n"
            "      position           0, 0, 0 pt\n"
            "      X rotation         0 deg\n"
            "      Y rotation         0 deg\n"
            "      Z rotation         0 deg\n"
            "      scale              100, 100, 100 %\n"
            "      anchor point       0, 0, 0 pt\n"
            "    null \"arm\"\n"
            "        position           (0, 0, 0 pt)   3 keys, frames 0 to 47 (0 s to 1.958 s)\n"
            "        X rotation         12 deg\n"
            "        Y rotation         -34.5 deg\n"
            "        Z rotation         56 deg\n"
            "        scale              100, 100, 100 %\n"
            "        anchor point       0, 0, 0 pt\n"
            "      camera \"shotcamShape\", aimed at its point of interest\n"
            "          zoom               (2057.386 px)   1 key, frame 0 (0 s)\n"
            "          film size          36 pt (12.7 mm) vertically\n"
            "          position           0, -10.25, -20.5 pt\n"
            "          X rotation         0 deg\n"
            "          Y rotation         0 deg\n"
            "          Z rotation         0 deg\n"
            "          scale              100, 100, 100 %\n"
            "          point of interest  1.5, 2.5, 3.5 pt\n");
}

TEST(Outline, MessagesStandAtTheEndEachOnALineOfItsOwn) {
  HandBuiltScene scene;
  scene.folder.compositions.clear();
  scene.report.outcome = Outcome::Failed;
  scene.report.result.messages = {"Error reading Maya file.", "two\nlines"};
  EXPECT_EQ(outlineOf(scene.report),
            "shots/crane.ma: nothing was imported\n\nmessages\n  Error reading Maya file.\n  two\\nlines\n");
}

TEST(Outline, AnImportThatFailedHalfwaySaysSo) {
  HandBuiltScene scene;
  scene.report.outcome = Outcome::Failed;
  EXPECT_TRUE(
      contains(outlineOf(scene.report), "crane.ma: 1 composition, 1 camera, 2 nulls, 4 keys (incomplete)\n"));
}

TEST(Outline, ASceneWithoutCamerasIsReportedInOneLine) {
  HandBuiltScene scene;
  scene.folder.compositions.clear();
  scene.report.outcome = Outcome::Nothing;
  EXPECT_EQ(outlineOf(scene.report), "shots/crane.ma: nothing to import, the scene has no cameras\n");
}

TEST(Outline, AnEmptyCompositionSaysThatItHasNoLayers) {
  HandBuiltScene scene;
  scene.composition.layers.clear();
  EXPECT_TRUE(contains(outlineOf(scene.report), "(48 frames)\n  no layers\n"));
}

TEST(Outline, HostileNamesAreEscapedWhereverTheyStand) {
  HandBuiltScene scene;
  scene.report.path = "a\x1b[2J.ma";
  scene.composition.name = "b\nc";
  scene.layers[0].name = "d\x1b]0;e\a";
  scene.report.result.messages = {"f\x1bg"};
  for (const Detail detail : {Detail::Layers, Detail::Properties}) {
    const std::string outline = outlineOf(scene.report, detail);
    EXPECT_EQ(outline.find('\x1b'), std::string::npos);
    EXPECT_EQ(outline.find('\a'), std::string::npos);
    EXPECT_TRUE(contains(outline, "a\\x1b[2J.ma: 1 composition"));
    EXPECT_TRUE(contains(outline, "\"b\\nc\"   1920"));
    EXPECT_TRUE(contains(outline, "camera \"d\\x1b]0;e\\x07\""));
    EXPECT_TRUE(contains(outline, "  f\\x1bg\n"));
  }
}

TEST(Outline, AChainOfTwentyThousandParentsIsShownInDepthsAndDoesNotGrowTheLines) {
  HandBuiltScene scene;
  constexpr std::size_t links = 20'000;
  refhost::Layer* parent = scene.add(refhost::LayerKind::Null, "link", nullptr);
  for (std::size_t i = 1; i < links; ++i) parent = scene.add(refhost::LayerKind::Null, "link", parent);
  const std::string outline = outlineOf(scene.report);
  EXPECT_TRUE(contains(outline, "[depth 19999] null \"link\"\n"));
  EXPECT_FALSE(contains(outline, "[depth 24]"));
  EXPECT_TRUE(contains(outline, std::string(50, ' ') + "[depth 25] null"));
  std::istringstream lines(outline);
  for (std::string line; std::getline(lines, line);) ASSERT_LT(line.size(), 120u);
}

}  // namespace
}  // namespace mayascene

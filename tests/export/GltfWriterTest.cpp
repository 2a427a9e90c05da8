#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <memory>

#include "tests/export/GltfReader.h"
#include "tests/export/HostileCompositions.h"
#include "tests/export/Shots.h"
#include "tests/export/WrittenFiles.h"

namespace exporttest {
namespace {

using diag::Code;
using interchange::Channel;
using interchange::Composition;
using interchange::LayerKind;

SeenScene Seen(const Written& written) {
  return ReadGltf(written.file, [&](const std::string& name) { return written.beside.at(name); });
}

class GltfWriterTest : public testing::TestWithParam<const char*> {
 protected:
  Written Write(const Composition& composition) const { return WriteAs(GetParam(), composition); }
};
INSTANTIATE_TEST_SUITE_P(Forms, GltfWriterTest, testing::Values("gltf", "glb"),
                         [](const auto& form) { return std::string(form.param); });

// The largest part of any place or axis up to the root. It bounds the effect of rounding to 32 bits.
double Extent(const Composition& composition) {
  double extent = 1;
  for (std::size_t layer = 0; layer < composition.layers.size(); ++layer) {
    for (std::size_t frame = 0; frame < composition.frames; ++frame) {
      const Seat seat = WorldSeat(composition, layer, frame);
      extent = std::max(extent, LargestPart(seat.place) * composition.metersPerUnit);
    }
  }
  return extent;
}

TEST_P(GltfWriterTest, EveryLayerStandsAtEveryFrameWhereTheCompositionHasIt) {
  for (const auto& [name, composition] : AllShots()) {
    const Written written = Write(composition);
    ASSERT_TRUE(written.done) << name;
    const SeenScene seen = Seen(written);
    ASSERT_EQ(seen.layers.size(), composition.layers.size()) << name;
    const double most = 8 * std::numeric_limits<float>::epsilon() * Extent(composition);
    for (std::size_t layer = 0; layer < composition.layers.size(); ++layer) {
      EXPECT_EQ(seen.layers[layer].name, composition.layers[layer].name);
      EXPECT_EQ(seen.layers[layer].parent, composition.layers[layer].parent);
      for (std::size_t frame = 0; frame < composition.frames; ++frame) {
        const Seat wanted = WorldSeat(composition, layer, frame);
        const double seconds = composition.FrameNumber(frame) / composition.framesPerSecond;
        const Seat found = seen.WorldOf(layer, static_cast<float>(seconds));
        for (std::size_t i = 0; i < 3; ++i) {
          EXPECT_NEAR(found.place[i], wanted.place[i] * composition.metersPerUnit, most)
              << name << ' ' << layer << ' ' << frame;
          for (std::size_t j = 0; j < 3; ++j) {
            EXPECT_NEAR(found.axes[i][j], wanted.axes[i][j], 4e-6) << name << ' ' << layer << ' ' << frame;
          }
        }
      }
    }
  }
}

TEST_P(GltfWriterTest, KnownPointsLandOnTheirPixelsAtEveryFrame) {
  double worst = 0;
  std::size_t count = 0;
  for (const auto& [name, composition] : AllShots()) {
    const SeenScene seen = Seen(Write(composition));
    for (std::size_t camera = 0; camera < composition.layers.size(); ++camera) {
      if (composition.layers[camera].kind != LayerKind::Camera) continue;
      EXPECT_NEAR(seen.layers[camera].aspect, composition.width / composition.height, 1e-12);
      for (std::size_t frame = 0; frame < composition.frames; ++frame) {
        const double seconds = composition.FrameNumber(frame) / composition.framesPerSecond;
        const Seat wanted = WorldSeat(composition, camera, frame);
        const Seat found = seen.WorldOf(camera, static_cast<float>(seconds));
        const double zoom = seen.ZoomOf(camera, static_cast<float>(seconds), composition.height);
        for (Point point : PointsBefore(composition, camera, frame)) {
          const auto one = PixelOf(wanted, composition.layers[camera].lens->zoom.at(frame), point);
          for (double& part : point) part *= composition.metersPerUnit;
          const auto other = PixelOf(found, zoom, point);
          ASSERT_TRUE(one && other) << name << ' ' << camera << ' ' << frame;
          worst = std::max({worst, std::fabs((*one)[0] - (*other)[0]), std::fabs((*one)[1] - (*other)[1])});
          ++count;
        }
      }
    }
  }
  EXPECT_GT(count, 300u);
  EXPECT_LT(worst, 0.02);
  RecordProperty("worst", std::to_string(worst));
}

TEST_P(GltfWriterTest, RotationsTakeTheShortWayFromFrameToFrame) {
  const SeenScene seen = Seen(Write(RigShot()));
  const Track& turned = seen.layers[3].rotation;
  ASSERT_EQ(turned.values.size(), 31u);
  for (std::size_t i = 1; i < turned.values.size(); ++i) {
    double cosine = 0;
    for (std::size_t part = 0; part < 4; ++part)
      cosine += turned.values[i][part] * turned.values[i - 1][part];
    EXPECT_GE(cosine, 0) << i;
  }
}

TEST_P(GltfWriterTest, AnAnimatedZoomIsAnExtensionThatIsNotRequired) {
  const Composition composition = RigShot();
  const Written written = Write(composition);
  const nlohmann::json document = GltfJsonOf(written.file);
  EXPECT_EQ(document["extensionsUsed"], nlohmann::json::array({"KHR_animation_pointer"}));
  EXPECT_FALSE(document.contains("extensionsRequired"));
  EXPECT_DOUBLE_EQ(document["cameras"][0]["perspective"]["yfov"].get<double>(), 2 * std::atan(540.0 / 2000));
  EXPECT_EQ(written.CountOf(Code::ExportZoomByExtension), 1u);
  const Written still = Write(StillShot());
  EXPECT_FALSE(GltfJsonOf(still.file).contains("extensionsUsed"));
  EXPECT_EQ(still.CountOf(Code::ExportZoomByExtension), 0u);
}

TEST_P(GltfWriterTest, WhatGltfHasNoPlaceForIsInItsExtras) {
  const nlohmann::json document = GltfJsonOf(Write(RigShot()).file);
  const nlohmann::json& lens = document["cameras"][0]["extras"];
  EXPECT_EQ(lens["filmOffsetX"], 0.031);
  EXPECT_EQ(lens["filmOffsetY"], -0.017);
  EXPECT_EQ(lens["squeeze"], 1.95);
  EXPECT_EQ(lens["filmWidth"], 24.89);
  const nlohmann::json& scene = document["scenes"][0]["extras"];
  EXPECT_EQ(scene["pixelAspect"], 2.0);
  EXPECT_EQ(scene["firstFrame"], 1001.0);
  EXPECT_EQ(scene["frames"], 31);
  EXPECT_EQ(scene["width"], 1998.0);
  EXPECT_FALSE(GltfJsonOf(Write(StillShot()).file)["cameras"][0]["extras"].contains("squeeze"));
}

TEST_P(GltfWriterTest, TimesAreTheScenesFramesWhereTheyCanBe) {
  Composition composition = AimedShot();
  composition.framesPerSecond = 25;
  composition.firstFrame = 50;
  const Written own = Write(composition);
  EXPECT_EQ(Seen(own).range, (std::array<double, 2>{2.0, static_cast<float>(73.0 / 25)}));
  EXPECT_EQ(own.CountOf(Code::ExportTimesShifted), 0u);
  for (const double first : {-1.0, 1e6}) {
    composition.firstFrame = first;
    const Written shifted = Write(composition);
    EXPECT_EQ(Seen(shifted).range, (std::array<double, 2>{0.0, static_cast<float>(23.0 / 25)})) << first;
    EXPECT_EQ(shifted.CountOf(Code::ExportTimesShifted), 1u) << first;
    EXPECT_EQ(GltfJsonOf(shifted.file)["scenes"][0]["extras"]["firstFrame"], first);
  }
}

TEST_P(GltfWriterTest, FramesOfOneTimeAreRefused) {
  Composition composition = StillShot();
  composition.frames = (1u << 24) + 3;
  composition.layers[0].position[0] =
      Channel(std::make_shared<const std::vector<double>>(std::vector<double>{0, 5}), {1, 2});
  const Written written = Write(composition);
  EXPECT_FALSE(written.done);
  EXPECT_EQ(written.CountOf(Code::ExportTimesTooFine), 1u);
}

TEST_P(GltfWriterTest, ValuesThatStayAreInNoAnimation) {
  Composition composition = StillShot();
  composition.frames = 3;
  composition.layers[0].position[0] = Channel(std::vector<double>{1, 1, 1});
  const Written written = Write(composition);
  EXPECT_FALSE(GltfJsonOf(written.file).contains("animations"));
  EXPECT_TRUE(written.beside.empty());
  composition.layers[0].position[0] = Channel(std::vector<double>{1, 1, 1.5});
  const nlohmann::json moved = GltfJsonOf(Write(composition).file);
  ASSERT_EQ(moved["animations"][0]["channels"].size(), 1u);
  EXPECT_EQ(moved["animations"][0]["channels"][0]["target"]["path"], "translation");
}

TEST_P(GltfWriterTest, NumbersBeyondThirtyTwoBitsAreAnErrorWithTheLayersName) {
  for (const bool moves : {false, true}) {
    Composition composition = StillShot();
    composition.frames = 2;
    composition.layers[1].position[1] = moves ? Channel(std::vector<double>{1, 1e41}) : Channel(1e41);
    const Written written = Write(composition);
    EXPECT_FALSE(written.done);
    EXPECT_EQ(written.CountOf(Code::ExportNumberTooLarge), 1u);
  }
}

TEST_P(GltfWriterTest, ALensWithoutAnAngleIsAnError) {
  for (const double zoom : {1e50, 1e-20}) {
    Composition composition = StillShot();
    composition.layers[0].lens->zoom = zoom;
    const Written written = Write(composition);
    EXPECT_FALSE(written.done) << zoom;
    EXPECT_EQ(written.CountOf(Code::ExportLensUnusable), 1u) << zoom;
  }
}

TEST_P(GltfWriterTest, CamerasUnderUnevenScaleAreReported) {
  EXPECT_EQ(Write(RigShot()).CountOf(Code::ExportCameraScaled), 1u);
  Composition composition = RigShot();
  composition.layers[1].parent.reset();
  EXPECT_EQ(Write(composition).CountOf(Code::ExportCameraScaled), 0u);
  composition.layers[1].scale[1] = 1 + 1e-15;
  EXPECT_EQ(Write(composition).CountOf(Code::ExportCameraScaled), 0u);
  composition.layers[1].scale[1] = 1.001;
  EXPECT_EQ(Write(composition).CountOf(Code::ExportCameraScaled), 1u);
}

TEST_P(GltfWriterTest, NamesOfAnyBytesBecomeText) {
  Composition composition = StillShot();
  composition.layers[0].name = "a\xff\"\n";
  composition.layers[1].name = "";
  const Written written = Write(composition);
  EXPECT_EQ(Seen(written).layers[0].name, "a\xef\xbf\xbd\"\n");
  EXPECT_FALSE(GltfJsonOf(written.file)["nodes"][1].contains("name"));
  EXPECT_EQ(written.CountOf(Code::ExportNameReplaced), 1u);
}

TEST_P(GltfWriterTest, ACompositionWithoutLayersIsAnEmptyScene) {
  Composition composition = StillShot();
  composition.layers.clear();
  const Written written = Write(composition);
  EXPECT_TRUE(written.done);
  EXPECT_TRUE(Seen(written).layers.empty());
}

TEST_P(GltfWriterTest, HostileCompositionsGiveFilesThatAReaderTakesOrAnError) {
  std::size_t files = 0, errors = 0;
  for (std::uint64_t seed = 0; seed < interchange_test::kHostileCompositions; ++seed) {
    Composition composition = interchange_test::HostileComposition(seed);
    composition.axes = interchange::Axes::Scene;
    const Written written = Write(composition);
    EXPECT_NE(written.done, written.errors != 0) << seed;
    if (!written.done) {
      ++errors;
      continue;
    }
    ++files;
    std::size_t seen = 0;
    ASSERT_NO_THROW(seen = Seen(written).layers.size()) << seed;
    ASSERT_EQ(seen, composition.layers.size()) << seed;
  }
  EXPECT_GT(files, 300u);
  EXPECT_GT(errors, 100u);
}

TEST(GltfFiles, TheDataAreInAFileBesideTheOther) {
  const Written written = WriteAs("gltf", RigShot());
  ASSERT_EQ(written.beside.size(), 1u);
  EXPECT_EQ(written.beside.begin()->first, "shot.bin");
  EXPECT_EQ(GltfJsonOf(written.file)["buffers"][0]["uri"], "shot.bin");
  EXPECT_TRUE(WriteAs("glb", RigShot()).beside.empty());
}

TEST(GltfFiles, TheDataHaveTheNameOfTheOtherAndTheReferenceToThemIsAUri) {
  const Written written = WriteAs("gltf", RigShot(), 0, "\xe5\xa0\xb4 a:b~%");
  ASSERT_EQ(written.beside.size(), 1u);
  EXPECT_EQ(written.beside.begin()->first, "\xe5\xa0\xb4 a:b~%.bin");
  EXPECT_EQ(GltfJsonOf(written.file)["buffers"][0]["uri"], "%E5%A0%B4%20a%3Ab~%25.bin");
}

TEST(GltfFiles, AnOutputThatCannotBeMadeEndsTheWriting) {
  EXPECT_FALSE(WriteAs("gltf", RigShot(), 1).done);
  EXPECT_FALSE(WriteAs("gltf", RigShot(), 2).done);
  EXPECT_FALSE(WriteAs("glb", RigShot(), 1).done);
  EXPECT_TRUE(WriteAs("glb", RigShot(), 2).done);
}

}  // namespace
}  // namespace exporttest

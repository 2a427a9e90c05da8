#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <memory>

#include "tests/export/HostileCompositions.h"
#include "tests/export/Shots.h"
#include "tests/export/UsdaReader.h"
#include "tests/export/WrittenFiles.h"

namespace exporttest {
namespace {

using diag::Code;
using interchange::Axes;
using interchange::Channel;
using interchange::Composition;
using interchange::LayerKind;
using testing::HasSubstr;
using testing::Not;

SeenScene Seen(const Composition& composition) {
  return ReadUsda(WriteAs("usda", composition).file, composition.axes == Axes::Host);
}

// Prims come in the order of the tree: the layer with the name.
std::size_t PrimOf(const SeenScene& seen, const std::string& name) {
  const auto found = std::find_if(seen.layers.begin(), seen.layers.end(),
                                  [&](const SeenLayer& layer) { return layer.name == name; });
  EXPECT_NE(found, seen.layers.end()) << name;
  return static_cast<std::size_t>(found - seen.layers.begin());
}

class UsdaWriterTest : public testing::TestWithParam<Axes> {};
INSTANTIATE_TEST_SUITE_P(Axes, UsdaWriterTest, testing::Values(Axes::Scene, Axes::Host),
                         [](const auto& axes) { return axes.param == Axes::Host ? "host" : "scene"; });

TEST_P(UsdaWriterTest, EveryLayerStandsAtEveryFrameWhereTheCompositionHasIt) {
  for (const auto& [name, composition] : AllShots(GetParam())) {
    const SeenScene seen = Seen(composition);
    ASSERT_EQ(seen.layers.size(), composition.layers.size()) << name;
    EXPECT_EQ(seen.metersPerUnit, composition.metersPerUnit);
    EXPECT_EQ(seen.timesPerSecond, composition.framesPerSecond);
    EXPECT_EQ(seen.range[0], composition.firstFrame);
    for (std::size_t layer = 0; layer < composition.layers.size(); ++layer) {
      const std::size_t prim = PrimOf(seen, composition.layers[layer].name);
      for (std::size_t frame = 0; frame < composition.frames; ++frame) {
        const Seat wanted = WorldSeat(composition, layer, frame);
        const Seat found = seen.WorldOf(prim, composition.FrameNumber(frame));
        for (std::size_t i = 0; i < 3; ++i) {
          EXPECT_NEAR(found.place[i], wanted.place[i], 1e-9) << name << ' ' << layer << ' ' << frame;
          for (std::size_t j = 0; j < 3; ++j) {
            EXPECT_NEAR(found.axes[i][j], wanted.axes[i][j], 1e-12) << name << ' ' << layer << ' ' << frame;
          }
        }
      }
    }
  }
}

TEST_P(UsdaWriterTest, KnownPointsLandOnTheirPixelsAtEveryFrame) {
  double worst = 0;
  std::size_t count = 0;
  for (const auto& [name, composition] : AllShots(GetParam())) {
    const SeenScene seen = Seen(composition);
    for (std::size_t camera = 0; camera < composition.layers.size(); ++camera) {
      if (composition.layers[camera].kind != LayerKind::Camera) continue;
      const std::size_t prim = PrimOf(seen, composition.layers[camera].name);
      ASSERT_TRUE(seen.layers[prim].camera);
      EXPECT_NEAR(seen.layers[prim].aspect, composition.width / composition.height, 1e-12);
      for (std::size_t frame = 0; frame < composition.frames; ++frame) {
        Seat wanted = WorldSeat(composition, camera, frame);
        Seat found = seen.WorldOf(prim, composition.FrameNumber(frame));
        for (Seat* seat : {&wanted, &found}) {
          if (GetParam() == Axes::Host) seat->axes = Scaled(seat->axes, {1, -1, -1});
        }
        const double zoom = seen.ZoomOf(prim, composition.FrameNumber(frame), composition.height);
        for (const Point& point : PointsBefore(composition, camera, frame)) {
          const auto one = PixelOf(wanted, composition.layers[camera].lens->zoom.at(frame), point);
          const auto other = PixelOf(found, zoom, point);
          ASSERT_TRUE(one && other) << name << ' ' << camera << ' ' << frame;
          worst = std::max({worst, std::fabs((*one)[0] - (*other)[0]), std::fabs((*one)[1] - (*other)[1])});
          ++count;
        }
      }
    }
  }
  EXPECT_GT(count, 300u);
  EXPECT_LT(worst, 1e-6);
  RecordProperty("worst", std::to_string(worst));
}

TEST(UsdaWriter, ACameraIsBelowThePrimThatMoves) {
  const std::string text = WriteAs("usda", AimedShot()).file;
  EXPECT_THAT(text, HasSubstr("def Xform \"dance_cam\""));
  EXPECT_THAT(text, HasSubstr("def Camera \"dance_cam_lens\""));
  EXPECT_THAT(text, Not(HasSubstr("rotateX = 180")));
  EXPECT_THAT(WriteAs("usda", AimedShot(Axes::Host)).file, HasSubstr("rotateX = 180"));
}

TEST(UsdaWriter, TheLensIsInTenthsOfAUnit) {
  Composition composition = RigShot();
  const std::string text = WriteAs("usda", composition).file;
  EXPECT_THAT(text, HasSubstr("float horizontalAperture = 24.89\n"));
  const SeenScene seen = ReadUsda(text);
  const SeenLayer& camera = seen.layers[PrimOf(seen, "shot_cam")];
  EXPECT_NEAR(camera.offset[0], 0.031 * 25.4 / 24.89, 1e-12);
  EXPECT_NEAR(camera.offset[1], -0.017 * 25.4 / (24.89 * 1080 / 1998), 1e-12);
  composition.metersPerUnit = 1;
  EXPECT_THAT(WriteAs("usda", composition).file, HasSubstr("float horizontalAperture = 0.2489\n"));
  EXPECT_THAT(WriteAs("usda", StillShot()).file, Not(HasSubstr("ApertureOffset")));
}

TEST(UsdaWriter, TurnsKeepTheirNumberAndDoublesTheirBits) {
  const SeenScene seen = Seen(RigShot());
  EXPECT_EQ(seen.layers[PrimOf(seen, "rig")].rotation.At(1031)[1], 170 * 30 - 700);
  EXPECT_EQ(seen.layers[PrimOf(seen, "shot_cam")].position.At(1007)[1], std::cos(6 / 3.0) * 20);
}

TEST(UsdaWriter, ValuesThatStayHaveNoSamples) {
  Composition composition = StillShot();
  composition.frames = 2;
  composition.layers[0].position[0] = Channel(std::vector<double>{4, 4});
  EXPECT_THAT(WriteAs("usda", composition).file, Not(HasSubstr("timeSamples")));
  composition.layers[0].position[0] = Channel(std::vector<double>{4, 5});
  EXPECT_THAT(WriteAs("usda", composition).file, HasSubstr("xformOp:translate.timeSamples"));
}

TEST(UsdaWriter, AimedCamerasTurnWithoutAJump) {
  const SeenScene seen = Seen(AimedShot());
  const Track& turned = seen.layers[PrimOf(seen, "dance_cam")].rotation;
  ASSERT_EQ(turned.values.size(), 24u);
  for (std::size_t i = 1; i < turned.values.size(); ++i) {
    for (std::size_t axis = 0; axis < 3; ++axis) {
      EXPECT_LT(std::fabs(turned.values[i][axis] - turned.values[i - 1][axis]), 90) << i << ' ' << axis;
    }
  }
}

TEST(UsdaWriter, NamesOfAnyBytesBecomePrimsOfTheirOwn) {
  Composition composition = StillShot();
  composition.layers.resize(6, composition.layers[1]);
  const char* names[] = {"a b", "a.b", "A_B", "7up", "", "x\" {\n\x1b\\ \xff"};
  for (std::size_t i = 0; i < 6; ++i) composition.layers[i].name = names[i];
  const Written written = WriteAs("usda", composition);
  for (const char* prim : {"\"a_b\"", "\"a_b_2\"", "\"A_B_3\"", "\"_7up\"", "\"null\"", "\"x__"}) {
    EXPECT_THAT(written.file, HasSubstr(std::string("def Xform ") + prim));
  }
  const SeenScene seen = ReadUsda(written.file);
  for (std::size_t i = 0; i < 5; ++i) (void)PrimOf(seen, names[i]);
  (void)PrimOf(seen, "x\" {\n\x1b\\ \xef\xbf\xbd");
  EXPECT_EQ(written.CountOf(Code::ExportNameReplaced), 1u);
}

TEST(UsdaWriter, AYAxisThatPointsDownIsReported) {
  EXPECT_EQ(WriteAs("usda", RigShot(Axes::Host)).CountOf(Code::ExportDownAxisLost), 1u);
  EXPECT_EQ(WriteAs("usda", RigShot()).CountOf(Code::ExportDownAxisLost), 0u);
}

TEST(UsdaWriter, FramesThatWouldHaveOneTimeAreRefused) {
  Composition composition = RigShot();
  composition.firstFrame = 1e17;
  const Written written = WriteAs("usda", composition);
  EXPECT_FALSE(written.done);
  EXPECT_EQ(written.CountOf(Code::ExportTimesTooFine), 1u);
}

TEST(UsdaWriter, ALensBeyondThirtyTwoBitsIsAnErrorWithTheLayersName) {
  Composition composition = StillShot();
  composition.layers[0].lens->filmOffsetX = 1e41;
  const Written written = WriteAs("usda", composition);
  EXPECT_FALSE(written.done);
  EXPECT_EQ(written.CountOf(Code::ExportNumberTooLarge), 1u);
}

TEST(UsdaWriter, AnOutputThatCannotBeMadeEndsTheWriting) { EXPECT_FALSE(WriteAs("usda", RigShot(), 1).done); }

TEST(UsdaWriter, HostileCompositionsGiveTextThatAReaderTakesOrAnError) {
  std::size_t files = 0, errors = 0;
  for (std::uint64_t seed = 0; seed < interchange_test::kHostileCompositions; ++seed) {
    const Composition composition = interchange_test::HostileComposition(seed);
    const Written written = WriteAs("usda", composition);
    EXPECT_NE(written.done, written.errors != 0) << seed;
    if (!written.done) {
      ++errors;
      continue;
    }
    ++files;
    std::size_t seen = 0;
    ASSERT_NO_THROW(seen = ReadUsda(written.file, composition.axes == Axes::Host).layers.size()) << seed;
    ASSERT_EQ(seen, composition.layers.size()) << seed;
  }
  EXPECT_GT(files, 300u);
  EXPECT_GT(errors, 100u);
}

}  // namespace
}  // namespace exporttest

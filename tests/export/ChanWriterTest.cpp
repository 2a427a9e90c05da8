#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <ctime>
#include <numbers>
#include <sstream>
#include <string>
#include <vector>

#include "diag/Collector.h"
#include "export/Format.h"
#include "tests/export/HostileCompositions.h"

namespace interchange {
namespace {

using diag::Code;
using interchange_test::FilesInMemory;
using interchange_test::HostileComposition;
using testing::ElementsAre;

using Row = std::vector<double>;

// Reads a .chan file strictly: eight finite numbers a line, the first one whole and one above that before it.
std::optional<std::vector<Row>> RowsOf(const std::string& text) {
  std::vector<Row> rows;
  std::istringstream lines(text);
  for (std::string line; std::getline(lines, line);) {
    std::istringstream words(line);
    Row row;
    for (double value = 0.0; words >> value;) row.push_back(value);
    if (!words.eof() || row.size() != 8) return std::nullopt;
    if (row[0] != std::floor(row[0]) || (!rows.empty() && row[0] != rows.back()[0] + 1.0))
      return std::nullopt;
    for (const double value : row) {
      if (!std::isfinite(value)) return std::nullopt;
    }
    rows.push_back(row);
  }
  return rows;
}

Layer Camera(const std::string& name) {
  Layer camera;
  camera.name = name;
  camera.kind = LayerKind::Camera;
  camera.lens.emplace();
  camera.lens->zoom = 540.0;
  return camera;
}

Composition Shot() {
  Composition composition;
  composition.width = 1920;
  composition.height = 1080;
  composition.firstFrame = 101;
  composition.frames = 2;
  Layer arm;
  arm.position[1] = 7.0;
  arm.rotation[1] = 90.0;
  arm.scale[0] = 2.0;
  Layer camera = Camera("cam");
  camera.parent = 0;
  camera.position[0] = Channel(std::vector<double>{1.5, 2.5});
  camera.rotation[0] = -30.0;
  composition.layers = {arm, camera};
  return composition;
}

TEST(ChanWriter, ALineForEachFrameInTheWorldWithoutScale) {
  FilesInMemory files;
  diag::Collector diagnostics("");
  ASSERT_TRUE(Write(*FindFormat("chan"), Shot(), {}, files, &diagnostics));
  const auto rows = RowsOf(files.main());
  ASSERT_TRUE(rows) << files.main();
  ASSERT_EQ(rows->size(), 2u);
  const Row expected = {102, 0, 7, -5, -30, 90, 0, 90};
  for (std::size_t i = 0; i < expected.size(); ++i) EXPECT_NEAR((*rows)[1][i], expected[i], 1e-12) << i;
  EXPECT_EQ(diagnostics.CountOf(Code::ExportRotationOrder), 1u);
  EXPECT_EQ(diagnostics.CountOf(Code::ExportNullsLeftOut), 1u);
  EXPECT_EQ(diagnostics.CountOf(Code::ExportPartLost), 1u);
  EXPECT_EQ(diagnostics.count(), 3u);
}

TEST(ChanWriter, AnglesGoOnAcrossHalfATurn) {
  Composition composition = Shot();
  composition.layers.erase(composition.layers.begin());
  composition.layers[0].parent.reset();
  composition.layers[0].rotation[1] = Channel(std::vector<double>{170.0, 190.0});
  FilesInMemory files;
  diag::Collector diagnostics("");
  ASSERT_TRUE(Write(*FindFormat("chan"), composition, {}, files, &diagnostics));
  const auto rows = RowsOf(files.main());
  ASSERT_TRUE(rows);
  for (std::size_t i = 4; i < 7; ++i) EXPECT_LT(std::fabs((*rows)[1][i] - (*rows)[0][i]), 21.0) << i;
}

TEST(ChanWriter, SeveralCamerasHaveAFileEach) {
  Composition composition = Shot();
  composition.layers.push_back(Camera("../cam"));
  composition.layers.push_back(Camera("cam"));
  FilesInMemory files;
  diag::Collector diagnostics("");
  ASSERT_TRUE(Write(*FindFormat("chan"), composition, {}, files, &diagnostics));
  EXPECT_FALSE(files.hasMain());
  std::vector<std::string> names;
  for (const auto& [name, text] : files.beside()) names.push_back(name);
  EXPECT_THAT(names, ElementsAre("shot._cam.chan", "shot.cam.chan", "shot.cam_2.chan"));
}

TEST(ChanWriter, WithoutACameraThereIsNoFile) {
  Composition composition = Shot();
  composition.layers.pop_back();
  FilesInMemory files;
  diag::Collector diagnostics("");
  EXPECT_FALSE(Write(*FindFormat("chan"), composition, {}, files, &diagnostics));
  EXPECT_EQ(diagnostics.CountOf(Code::ExportWithoutCamera), 1u);
  EXPECT_FALSE(files.hasMain());
}

TEST(ChanWriter, WhatItHasNoPlaceForIsNamed) {
  Composition composition = Shot();
  composition.layers.erase(composition.layers.begin());
  composition.layers[0].parent.reset();
  composition.pixelAspect = 2.0;
  composition.firstFrame = 0.5;
  composition.layers[0].lens->filmOffsetX = 0.1;
  composition.layers[0].lens->squeeze = 2.0;
  FilesInMemory files;
  diag::Collector diagnostics("");
  ASSERT_TRUE(Write(*FindFormat("chan"), composition, {}, files, &diagnostics));
  EXPECT_EQ(diagnostics.CountOf(Code::ExportPartLost), 3u);
  EXPECT_EQ(diagnostics.CountOf(Code::ExportFramesRounded), 1u);
}

TEST(ChanWriter, FrameNumbersAreWrittenUpToTheLargestThatIsExactAndNoFurther) {
  Composition composition = Shot();
  for (const double first :
       {0x1p53 - 2.0, -0x1p53 + 2.0, 0x1p53 - 1.0, -0x1p53 + 1.0, 1e19, -1e19, 1e300, -1e300}) {
    composition.firstFrame = first;
    FilesInMemory files;
    diag::Collector diagnostics("");
    const bool exact = std::fabs(first) == 0x1p53 - 2.0;
    EXPECT_EQ(Write(*FindFormat("chan"), composition, {}, files, &diagnostics), exact) << first;
    EXPECT_EQ(diagnostics.CountOf(Code::ExportTimesTooFine), exact ? 0u : 1u) << first;
    if (!exact) continue;
    const auto rows = RowsOf(files.main());
    ASSERT_TRUE(rows) << files.main();
    EXPECT_EQ((*rows)[1][0], first + 1.0);
  }
}

TEST(ChanWriter, HostAxesComeOutAsThoseOfTheScene) {
  Composition scene = Shot();
  Composition host = Shot();
  host.axes = Axes::Host;
  for (Layer& layer : host.layers) {
    for (int axis = 1; axis < 3; ++axis) {
      layer.position[axis] = -layer.position[axis].at(0);
      layer.rotation[axis] = -layer.rotation[axis].at(0);
    }
  }
  FilesInMemory sceneFiles, hostFiles;
  diag::Collector diagnostics("");
  ASSERT_TRUE(Write(*FindFormat("chan"), scene, {}, sceneFiles, &diagnostics));
  ASSERT_TRUE(Write(*FindFormat("chan"), host, {}, hostFiles, &diagnostics));
  const auto a = RowsOf(sceneFiles.main()), b = RowsOf(hostFiles.main());
  ASSERT_TRUE(a && b);
  for (std::size_t i = 0; i < 8; ++i) EXPECT_NEAR((*a)[1][i], (*b)[1][i], 1e-12) << i;
}

// The least processor time, in seconds, for cameras each of which is a child of the previous one.
double SecondsFor(std::size_t cameras) {
  Composition composition;
  composition.frames = 20;
  for (std::size_t i = 0; i < cameras; ++i) {
    Layer& camera = composition.layers.emplace_back(Camera("cam" + std::to_string(i)));
    camera.position[0] = 0.25;
    camera.rotation[1] = 1.5;
    if (i != 0) camera.parent = i - 1;
  }
  double least = 1e9;
  for (int round = 0; round < 5; ++round) {
    FilesInMemory files;
    diag::Collector diagnostics("");
    const std::clock_t start = std::clock();
    EXPECT_TRUE(Write(*FindFormat("chan"), composition, {}, files, &diagnostics));
    least = std::min(least, static_cast<double>(std::clock() - start) / CLOCKS_PER_SEC);
  }
  return least;
}

// A walk up the chain for each camera takes some fifty times as long.
TEST(ChanWriter, EightTimesTheNestedCamerasTakeEightTimesAsLong) {
  EXPECT_LT(SecondsFor(800) / SecondsFor(100), 24.0);
}

TEST(ChanWriter, HostileCompositionsGiveLinesOrAnError) {
  std::size_t written = 0;
  for (std::uint64_t seed = 0; seed < interchange_test::kHostileCompositions; ++seed) {
    SCOPED_TRACE(seed);
    const Composition composition = HostileComposition(seed);
    FilesInMemory files;
    diag::Collector diagnostics("");
    if (!Write(*FindFormat("chan"), composition, {}, files, &diagnostics)) {
      ASSERT_GT(diagnostics.CountOf(diag::Severity::Error), 0u);
      continue;
    }
    ++written;
    std::vector<std::string> texts;
    if (files.hasMain()) texts.push_back(files.main());
    for (const auto& [name, text] : files.beside()) texts.push_back(text);
    ASSERT_FALSE(texts.empty());
    for (const std::string& text : texts) {
      const auto rows = RowsOf(text);
      ASSERT_TRUE(rows) << text;
      ASSERT_EQ(rows->size(), composition.frames);
    }
  }
  EXPECT_GT(written, interchange_test::kHostileCompositions / 3);
}

}  // namespace
}  // namespace interchange

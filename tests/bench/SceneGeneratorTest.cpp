#include "bench/SceneGenerator.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <ostream>
#include <sstream>
#include <streambuf>
#include <string>
#include <string_view>

namespace bench {
namespace {

constexpr std::uint64_t kSeed = 20240229;

std::string Scene(std::string_view workload, double scale, std::uint64_t seed = kSeed) {
  std::ostringstream out;
  findWorkload(workload)->write(out, scale, seed);
  return out.str();
}

int Count(std::string_view scene, std::string_view part) {
  int count = 0;
  for (std::size_t at = 0; (at = scene.find(part, at)) != std::string_view::npos; at += part.size()) ++count;
  return count;
}

// Takes bytes and keeps nothing but their number.
class Scales : public std::streambuf {
 public:
  double megabytes() const { return static_cast<double>(bytes_) / 1e6; }

 private:
  std::streamsize xsputn(const char*, std::streamsize count) override {
    bytes_ += count;
    return count;
  }
  int_type overflow(int_type byte) override {
    ++bytes_;
    return byte;
  }

  std::streamsize bytes_ = 0;
};

double Megabytes(std::string_view workload) {
  Scales scales;
  std::ostream out(&scales);
  findWorkload(workload)->write(out, 1.0, kSeed);
  return scales.megabytes();
}

TEST(SceneGeneratorTest, MeshIsOf200Megabytes) { EXPECT_NEAR(Megabytes("mesh"), 200.0, 4.0); }
TEST(SceneGeneratorTest, KeysIsOf125Megabytes) { EXPECT_NEAR(Megabytes("keys"), 125.0, 2.5); }
TEST(SceneGeneratorTest, NodesIsOf50Megabytes) { EXPECT_NEAR(Megabytes("nodes"), 50.0, 1.5); }
TEST(SceneGeneratorTest, CompositionIsOf42Megabytes) { EXPECT_NEAR(Megabytes("composition"), 42.5, 0.8); }

TEST(SceneGeneratorTest, MeshHoldsTheDataOf90MeshesAndFourBakedCameras) {
  const std::string scene = Scene("mesh", 0.01);
  EXPECT_EQ(Count(scene, "createNode mesh "), 90);
  EXPECT_EQ(Count(scene, "createNode camera "), 4);
  EXPECT_EQ(Count(scene, "createNode animCurve"), 4 * 6);
  EXPECT_EQ(Count(scene, ".ktv[0:239]"), 4 * 6);
  EXPECT_EQ(Count(scene, "connectAttr "), 4 * 6);
  for (const char* attribute : {"\".vt[0:", "\".ed[0:", "\".fc[0:", "\".n[0:", "\".uvst[0].uvsp[0:"})
    EXPECT_EQ(Count(scene, attribute), 90) << attribute;
}

TEST(SceneGeneratorTest, KeysHoldsNineConnectedCurvesATransform) {
  const std::string scene = Scene("keys", 0.01);
  EXPECT_EQ(Count(scene, "createNode transform "), 30 + 1) << "the camera has one too";
  EXPECT_EQ(Count(scene, "createNode animCurve"), 270);
  EXPECT_EQ(Count(scene, "-s 240 \".ktv[0:239]"), 270);
  EXPECT_EQ(Count(scene, "connectAttr "), 270);
}

TEST(SceneGeneratorTest, NodesHoldsManyNodesAndConnections) {
  const std::string scene = Scene("nodes", 0.01);
  EXPECT_EQ(Count(scene, "createNode transform "), 1200 + 1);
  EXPECT_EQ(Count(scene, "createNode locator "), 800);
  EXPECT_EQ(Count(scene, "createNode animCurve"), 100);
  EXPECT_EQ(Count(scene, "connectAttr "), 2000);
}

TEST(SceneGeneratorTest, CompositionHoldsAMarkedLocatorWithKeysForEveryTransform) {
  const std::string scene = Scene("composition", 0.01);
  EXPECT_EQ(Count(scene, "createNode transform "), 10 + 1);
  EXPECT_EQ(Count(scene, "_nullShape\" -p \"marker"), 10);
  for (const char* attribute : {".ktv", ".kit", ".kot", ".ktl", ".kwl"})
    EXPECT_EQ(Count(scene, "-s 1200 \"" + std::string(attribute) + "[0:1199]"), 10) << attribute;
  EXPECT_EQ(Count(scene, "connectAttr "), 10);
}

TEST(SceneGeneratorTest, TheSameSeedGivesTheSameScene) {
  for (const Workload& workload : kWorkloads) {
    const std::string scene = Scene(workload.name, 0.002);
    EXPECT_EQ(scene, Scene(workload.name, 0.002)) << workload.name;
    EXPECT_NE(scene, Scene(workload.name, 0.002, kSeed + 1)) << workload.name;
  }
}

TEST(SceneGeneratorTest, AnUnknownWorkloadIsNotFound) { EXPECT_EQ(findWorkload("curves"), nullptr); }

}  // namespace
}  // namespace bench

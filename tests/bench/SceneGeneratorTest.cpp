#include "bench/SceneGenerator.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <set>
#include <sstream>
#include <string>
#include <string_view>
#include <utility>

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

double Megabytes(std::string_view workload, double scale) {
  return static_cast<double>(Scene(workload, scale).size()) / 1e6;
}

// The size of the whole workload, by that of two small parts of it.
double WholeMegabytes(std::string_view workload) {
  constexpr double kPart = 0.05;
  const double part = Megabytes(workload, kPart);
  const double growth = Megabytes(workload, 2 * kPart) - part;
  return part + growth * (1.0 - kPart) / kPart;
}

TEST(SceneGeneratorTest, WorkloadsAreOfTheSizesInTheDocuments) {
  // The whole is larger than its parts foretell: its numbers have more digits.
  constexpr double kLongerNumbers = 0.05;
  const std::pair<const char*, double> sizes[] = {
      {"mesh", 200.0}, {"keys", 125.0}, {"nodes", 65.0}, {"composition", 43.0}, {"shot", 50.0}};
  for (const auto& [workload, size] : sizes) {
    EXPECT_NEAR(WholeMegabytes(workload), size, size * kLongerNumbers) << workload;
  }
}

TEST(SceneGeneratorTest, SizeLayersAndKeysGrowWithTheScale) {
  constexpr double kSmall = 0.02;
  for (const Workload& workload : workloads()) {
    std::ostringstream texts[3];
    Built built[3];
    for (int i = 0; i < 3; ++i) built[i] = workload.write(texts[i], kSmall * (1 << i), kSeed);
    const auto grown = [&](auto measure) {
      return measure(2) - measure(1) - 2.0 * (measure(1) - measure(0));
    };
    const auto bytes = [&](int i) { return static_cast<double>(texts[i].str().size()); };
    const auto layers = [&](int i) { return static_cast<double>(built[i].layers); };
    const auto keys = [&](int i) { return static_cast<double>(built[i].keys); };
    EXPECT_NEAR(grown(bytes), 0.0, 0.03 * bytes(2)) << workload.name;
    EXPECT_NEAR(grown(layers), 0.0, 0.05 * layers(2)) << workload.name;
    EXPECT_NEAR(grown(keys), 0.0, 0.05 * keys(2)) << workload.name;
  }
}

TEST(SceneGeneratorTest, TheTwoFormsOfTheShotDifferInTheQuotesOfPathsOnly) {
  std::string quoted = Scene("shot", 0.02);
  std::string unquoted = Scene("shot_unquoted", 0.02);
  EXPECT_EQ(quoted.size(), unquoted.size());
  EXPECT_EQ(Count(quoted, "\n\t\t1 \"|crew"), 10 * 4);
  EXPECT_EQ(Count(unquoted, "\n\t\t1 |crew"), 10 * 4);
  EXPECT_EQ(Count(quoted, " |"), 0);
  for (std::string* text : {&quoted, &unquoted})
    std::erase_if(*text, [](char c) { return c == '"' || c == ' '; });
  EXPECT_EQ(quoted, unquoted);
}

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
  EXPECT_EQ(Count(scene, "_nullShape\" -p \"joint"), 2) << "at the end of every other chain";
}

TEST(SceneGeneratorTest, NodesHoldsManyNodesAndConnections) {
  const std::string scene = Scene("nodes", 0.01);
  EXPECT_EQ(Count(scene, "createNode transform "), 1200 + 1);
  EXPECT_EQ(Count(scene, "createNode locator "), 800);
  EXPECT_EQ(Count(scene, "createNode locator -n \"crowd_nullShape_"), 50)
      << "every other chain with locators";
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

TEST(SceneGeneratorTest, ShotHoldsReferencesRigsMeshesAndATrackedCamera) {
  const std::string scene = Scene("shot", 0.01);
  EXPECT_EQ(Count(scene, "file -r -ns"), 10);
  EXPECT_EQ(Count(scene, "createNode reference "), 10);
  EXPECT_EQ(Count(scene, "-type \"dataReferenceEdits\""), 10);
  EXPECT_EQ(Count(scene, ".placeHolderList["), 10 * 7 * 6);
  EXPECT_EQ(Count(scene, "createNode skinCluster "), 12);
  EXPECT_EQ(Count(scene, "createNode parentConstraint "), 12);
  EXPECT_EQ(Count(scene, "createNode mesh "), 20);
  EXPECT_EQ(Count(scene, "createNode camera "), 4 + 1);
  EXPECT_EQ(Count(scene, "-s 240 \".ktv[0:239]"), 7) << "of the tracked camera";
}

TEST(SceneGeneratorTest, EveryNodeHasAnIdentifierOfItsOwn) {
  for (const Workload& workload : workloads()) {
    const std::string scene = Scene(workload.name, 0.002);
    constexpr std::string_view kAfterNode = "\";\n\trename -uid \"";
    constexpr std::string_view kForm = "XXXXXXXX-XXXX-XXXX-XXXX-XXXXXXXXXXXX";
    std::set<std::string> identifiers;
    for (std::size_t at = 0; (at = scene.find("createNode ", at)) != std::string::npos; ++at) {
      const std::size_t line = scene.find("\";\n", at);
      ASSERT_EQ(scene.compare(line, kAfterNode.size(), kAfterNode), 0) << workload.name;
      std::string identifier = scene.substr(line + kAfterNode.size(), kForm.size());
      identifiers.insert(identifier);
      const auto isDigit = [](char c) { return (c >= '0' && c <= '9') || (c >= 'A' && c <= 'F'); };
      std::replace_if(identifier.begin(), identifier.end(), isDigit, 'X');
      ASSERT_EQ(identifier, kForm) << workload.name;
    }
    EXPECT_EQ(static_cast<int>(identifiers.size()), Count(scene, "createNode ")) << workload.name;
  }
}

TEST(SceneGeneratorTest, TheSameSeedGivesTheSameScene) {
  for (const Workload& workload : workloads()) {
    const std::string scene = Scene(workload.name, 0.002);
    EXPECT_EQ(scene, Scene(workload.name, 0.002)) << workload.name;
    EXPECT_NE(scene, Scene(workload.name, 0.002, kSeed + 1)) << workload.name;
  }
}

TEST(SceneGeneratorTest, AnUnknownWorkloadIsNotFound) { EXPECT_EQ(findWorkload("curves"), nullptr); }

}  // namespace
}  // namespace bench

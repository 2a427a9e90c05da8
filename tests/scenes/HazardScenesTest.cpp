// Scenes made to do harm: each returns, with the code that its text deserves, and leaves nothing behind.
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
using testing::ElementsAreArray;
using testing::IsEmpty;

struct Hazard {
  const char* name;
  HostError code = 0;
  std::size_t compositions = 0;
  std::vector<std::string> cameras = {};
  std::vector<std::string> nulls = {};
};

void PrintTo(const Hazard& hazard, std::ostream* out) { *out << hazard.name; }

const std::vector<Hazard>& hazards() {
  // The pixels of a scene that says nothing of them are not square, so a scene with a camera makes two
  // compositions.
  static const std::vector<Hazard> all = {
      {.name = "h01_word_at_eof", .code = HOST_ERR_MAYA_UNEXPECTED_END},
      {.name = "h02_eof_in_createnode", .code = HOST_ERR_MAYA_UNEXPECTED_END},
      {.name = "h02b_eof_in_select", .code = HOST_ERR_MAYA_UNEXPECTED_END},
      {.name = "h02c_eof_in_connect", .code = HOST_ERR_MAYA_UNEXPECTED_END},
      {.name = "h02d_eof_in_setattr", .code = HOST_ERR_MAYA_UNEXPECTED_END},
      {.name = "h02e_eof_after_createNode_word"},
      {.name = "h03_embedded_nul_word", .compositions = 2, .cameras = {"c"}},
      {.name = "h03b_embedded_nul_between"},
      {.name = "h04_blockcomment_star_eof", .code = HOST_ERR_MAYA_UNEXPECTED_END},
      {.name = "h05_quote_unclosed", .code = HOST_ERR_MAYA_UNEXPECTED_END},
      {.name = "h06_highbyte", .code = HOST_ERR_MAYA_SYNTAX},
      {.name = "h10_dupcurve_two_keys"},
      {.name = "h11_dupcurve_nokeys_tan"},
      {.name = "h12_keys_then_bad_number", .code = HOST_ERR_NUMBER_SYNTAX},
      {.name = "h13_keys_then_lex_error", .code = HOST_ERR_MAYA_SYNTAX},
      {.name = "h14_unnamed_two_curves"},
      {.name = "h15_longname_two_curves"},
      {.name = "h16_select_between"},
      {.name = "h20_selfparent", .compositions = 2, .cameras = {"c"}},
      {.name = "h21_twocycle", .compositions = 2, .cameras = {"c"}, .nulls = {"b"}},
      {.name = "h22_valid_scene_same_names", .compositions = 2, .cameras = {"shotShape"}, .nulls = {"rig"}},
      {.name = "h23_locator_cycle", .compositions = 2, .cameras = {"c"}, .nulls = {"null1"}},
      {.name = "h30_w_huge"},
      {.name = "h31_key_time_overflow", .compositions = 2, .cameras = {"c"}},
      {.name = "h32_key_inf", .code = HOST_ERR_NUMBER_RANGE},
      {.name = "h33_short_scale"},
      {.name = "h40_option_eats_semicolon", .compositions = 2, .cameras = {"kept"}},
  };
  return all;
}

std::vector<std::string> messagesOf(HostError code) {
  if (code == HOST_ERR_MAYA_SYNTAX) return {"Error reading Maya file."};
  if (code == HOST_ERR_MAYA_UNEXPECTED_END) return {"Unexpected end of maya file."};
  return {};
}

class HazardScenes : public testing::Test {
 protected:
  void SetUp() override {
    if (!std::filesystem::exists(sharedFolder("hazards")))
      GTEST_SKIP() << "no hazards beside the source folder";
  }
};

class HazardScene : public HazardScenes, public testing::WithParamInterface<Hazard> {};

TEST_P(HazardScene, ReturnsItsCodeAndLeavesNothingBehind) {
  const Hazard& hazard = GetParam();
  ImportedScene scene(sharedFolder("hazards") / (std::string(hazard.name) + ".ma"));
  ASSERT_TRUE(scene.loaded());
  EXPECT_EQ(scene.result().code, hazard.code);
  EXPECT_EQ(scene.compositions(), hazard.compositions);
  EXPECT_THAT(scene.names(LayerKind::Camera), ElementsAreArray(hazard.cameras));
  EXPECT_THAT(scene.names(LayerKind::Null), ElementsAreArray(hazard.nulls));
  EXPECT_THAT(scene.result().messages, ElementsAreArray(messagesOf(hazard.code)));
  EXPECT_THAT(scene.result().refusals, IsEmpty());
  EXPECT_TRUE(scene.result().ledgerClean());
  EXPECT_TRUE(scene.unload().ledgerClean());
}

INSTANTIATE_TEST_SUITE_P(All, HazardScene, testing::ValuesIn(hazards()),
                         [](const auto& test) { return std::string(test.param.name); });

TEST_F(HazardScenes, KeyTimesPastTheRangeAreHeldAtItsEnd) {
  ImportedScene scene(sharedFolder("hazards") / "h31_key_time_overflow.ma");
  ASSERT_TRUE(scene.loaded());
  ASSERT_EQ(scene.compositions(), 2u);
  EXPECT_EQ(scene.project().compositions()[0].duration.value, 2147483647);
  EXPECT_EQ(scene.project().compositions()[0].duration.scale, 1000u);
}

TEST_F(HazardScenes, OfTwoTransformsOfOneNameTheFirstIsPlaced) {
  ImportedScene scene(sharedFolder("hazards") / "h22_valid_scene_same_names.ma");
  ASSERT_TRUE(scene.loaded());
  for (const refhost::Layer& layer : scene.project().layers()) {
    if (layer.name != "rig") continue;
    EXPECT_NEAR(layer.findStream(1)->value[2], -5.0, 1e-12);
    EXPECT_EQ(layer.parent, nullptr);
  }
}

TEST_F(HazardScenes, AThousandParentsAboveEachOfAThousandLocatorsAllBecomeNulls) {
  ImportedScene scene(sharedFolder("hazards") / "q_chain_1000.ma");
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

TEST_F(HazardScenes, ParentsWithoutEndAreRefusedAtTheCeilingAndTheNullsBeforeStay) {
  constexpr std::int32_t kMost = 5000;
  refhost::HostOptions options;
  options.mostLayers = kMost;
  ImportedScene scene(sharedFolder("hazards") / "q_chain_1000.ma", options);
  ASSERT_TRUE(scene.loaded());
  EXPECT_EQ(scene.result().code, HOST_ERR_TOO_MANY_LAYERS);
  EXPECT_THAT(scene.result().refusals,
              testing::ElementsAre("NewNullLayer: the host takes no more than 5000 layers"));
  EXPECT_THAT(scene.result().messages, IsEmpty());
  EXPECT_TRUE(scene.result().ledgerClean());
  EXPECT_EQ(scene.project().layers().size(), std::size_t{kMost});
  EXPECT_EQ(scene.layers(LayerKind::Camera), 1u);
}

TEST_F(HazardScenes, AreAllKnown) {
  std::set<std::string> known = {"q_chain_1000"}, there;
  for (const Hazard& hazard : hazards()) known.insert(hazard.name);
  for (const auto& entry : std::filesystem::directory_iterator(sharedFolder("hazards"))) {
    if (entry.path().extension() == ".ma") there.insert(entry.path().stem().string());
  }
  EXPECT_THAT(there, testing::ContainerEq(known));
}

}  // namespace

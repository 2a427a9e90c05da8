// Scenes of others, which lie in folders beside the source folder where somebody has them: what an import of
// each gives. All that they show is shown by scenes of our own too.
#include <gtest/gtest.h>

#include <filesystem>
#include <string>

#include "hostapi/ErrorCodes.h"
#include "tests/scenes/ImportedScene.h"
#include "tests/scenes/SceneOutcome.h"
#include "tests/support/LeftOut.h"

namespace {

using refhost::LayerKind;
using scenes::ImportedScene;

struct Outcome {
  const char* path;  // in ../shared
  HostError code = 0;
  std::size_t compositions = 0;
  std::size_t cameras = 0;
  std::size_t nulls = 0;
  std::size_t keys = 0;
  std::size_t aimed = 0;
};

constexpr Outcome kOutcomes[] = {
    {.path = "scenes/tracked_camera", .compositions = 1, .cameras = 1, .keys = 570},
    {.path = "scenes/animated_camera", .compositions = 1, .cameras = 1, .keys = 12},
    {.path = "scenes/camera_export_pal", .compositions = 2, .cameras = 1, .nulls = 5, .keys = 10},
    {.path = "scenes/five_cameras", .compositions = 1, .cameras = 5, .nulls = 11, .keys = 27},
    {.path = "scenes/lookat_short_names", .compositions = 1, .cameras = 1, .nulls = 1, .keys = 10},
    {.path = "scenes/lookat_full_names", .compositions = 2, .cameras = 1, .nulls = 1, .aimed = 1},
    {.path = "scenes/camera_rig_aim", .compositions = 1, .cameras = 1},
    {.path = "scenes/stereo_rigs", .compositions = 1, .cameras = 7, .nulls = 4},
    {.path = "scenes/inch_40fps", .compositions = 1},
    {.path = "scenes/unequal_keys",
     .code = HOST_ERR_MAYA_KEY_COUNTS,
     .compositions = 1,
     .cameras = 3,
     .keys = 25},
    {.path = "scenes/attribute_alias", .code = HOST_ERR_MAYA_SYNTAX},
    {.path = "scenes/unquoted_path", .code = HOST_ERR_MAYA_SYNTAX},
    {.path = "scenes/no_final_newline", .code = HOST_ERR_MAYA_UNEXPECTED_END},
    {.path = "hazards/h01_word_at_eof", .code = HOST_ERR_MAYA_UNEXPECTED_END},
    {.path = "hazards/h02_eof_in_createnode", .code = HOST_ERR_MAYA_UNEXPECTED_END},
    {.path = "hazards/h02b_eof_in_select", .code = HOST_ERR_MAYA_UNEXPECTED_END},
    {.path = "hazards/h02c_eof_in_connect", .code = HOST_ERR_MAYA_UNEXPECTED_END},
    {.path = "hazards/h02d_eof_in_setattr", .code = HOST_ERR_MAYA_UNEXPECTED_END},
    {.path = "hazards/h02e_eof_after_createNode_word"},
    {.path = "hazards/h03_embedded_nul_word", .compositions = 2, .cameras = 1},
    {.path = "hazards/h03b_embedded_nul_between"},
    {.path = "hazards/h04_blockcomment_star_eof", .code = HOST_ERR_MAYA_UNEXPECTED_END},
    {.path = "hazards/h05_quote_unclosed", .code = HOST_ERR_MAYA_UNEXPECTED_END},
    {.path = "hazards/h06_highbyte", .code = HOST_ERR_MAYA_SYNTAX},
    {.path = "hazards/h10_dupcurve_two_keys"},
    {.path = "hazards/h11_dupcurve_nokeys_tan"},
    {.path = "hazards/h12_keys_then_bad_number", .code = HOST_ERR_NUMBER_SYNTAX},
    {.path = "hazards/h13_keys_then_lex_error", .code = HOST_ERR_MAYA_SYNTAX},
    {.path = "hazards/h14_unnamed_two_curves"},
    {.path = "hazards/h15_longname_two_curves"},
    {.path = "hazards/h16_select_between"},
    {.path = "hazards/h20_selfparent", .compositions = 2, .cameras = 1},
    {.path = "hazards/h21_twocycle", .compositions = 2, .cameras = 1, .nulls = 1},
    {.path = "hazards/h22_valid_scene_same_names", .compositions = 2, .cameras = 1, .nulls = 1},
    {.path = "hazards/h23_locator_cycle", .compositions = 2, .cameras = 1, .nulls = 1},
    {.path = "hazards/h30_w_huge"},
    {.path = "hazards/h31_key_time_overflow", .compositions = 2, .cameras = 1},
    {.path = "hazards/h32_key_inf", .code = HOST_ERR_NUMBER_RANGE},
    {.path = "hazards/h33_short_scale"},
    {.path = "hazards/h40_option_eats_semicolon", .compositions = 2, .cameras = 1},
};

void expectOutcome(const std::filesystem::path& path, const Outcome& expected) {
  SCOPED_TRACE(expected.path);
  ImportedScene scene(path);
  ASSERT_TRUE(scene.loaded());
  EXPECT_EQ(scene.result().code, expected.code);
  EXPECT_EQ(scene.compositions(), expected.compositions);
  EXPECT_EQ(scene.layers(LayerKind::Camera), expected.cameras);
  EXPECT_EQ(scene.layers(LayerKind::Null), expected.nulls);
  EXPECT_EQ(scene.keys(), expected.keys);
  EXPECT_EQ(scene.aimedCameras(), expected.aimed);
  EXPECT_EQ(scene.result().messages, scenes::messagesOf(expected.code));
  EXPECT_TRUE(scene.result().refusals.empty());
  EXPECT_TRUE(scene.result().ledgerClean());
  EXPECT_TRUE(scene.unload().ledgerClean());
}

TEST(OutsideScenes, GiveWhatTheyAreKnownToGive) {
  const std::filesystem::path folder = std::filesystem::path(MAYASCENE_SOURCE_DIR) / ".." / "shared";
  std::size_t leftOut = 0;
  for (const Outcome& outcome : kOutcomes) {
    const std::filesystem::path path = folder / (std::string(outcome.path) + ".ma");
    if (std::filesystem::exists(path)) {
      expectOutcome(path, outcome);
    } else {
      ++leftOut;
    }
  }
  if (leftOut > 0)
    GTEST_SKIP() << testsupport::kLeftOut << leftOut << " scenes of ../shared, beside the source folder";
}

}  // namespace

#include "plugin/Globals.h"
#include "tests/support/BuilderFixture.h"
#include "tests/support/BuilderRun.h"
#include "tests/support/BuilderScene.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

std::vector<std::string> CompNames(const ImportRun& run) {
  std::vector<std::string> names;
  for (const refhost::Composition& comp : run.host->project().compositions()) names.push_back(comp.name);
  return names;
}

std::vector<std::string> LayerNames(const ImportRun& run) {
  std::vector<std::string> names;
  for (const refhost::Layer& layer : run.host->project().layers()) names.push_back(layer.name);
  return names;
}

TEST(AssemblyTest, ASceneWithoutACameraMakesNothing) {
  const ImportRun run = ImportText(SceneHead() + TransformText("t") + LocatorText("null1", "t"));
  EXPECT_EQ(run.result.code, 0);
  EXPECT_THAT(CompNames(run), IsEmpty());
}

TEST(AssemblyTest, TheDefaultPerspectiveCameraAloneYieldsAnEmptyComposition) {
  for (const char* const name : {"perspShape", "PERSPSHAPE", "perspshape"}) {
    const ImportRun run = ImportText(SceneHead() + RenderSize(640, 480) + CameraText(name, "persp"));
    EXPECT_THAT(CompNames(run), ElementsAre("shot01")) << name;
    EXPECT_THAT(LayerNames(run), IsEmpty()) << name;
  }
}

TEST(AssemblyTest, ThePerspectiveCameraIsKnownByItsNameAlone) {
  const ImportRun run = ImportText(SceneHead() + RenderSize(640, 480) + CameraText("perspShape1", "persp") +
                                   CameraText("my_perspShape", "persp"));
  EXPECT_THAT(LayerNames(run), ElementsAre("perspShape1", "my_perspShape"));
}

TEST(AssemblyTest, OrthographicCamerasAreSkipped) {
  const ImportRun run = ImportText(SceneHead() + RenderSize(640, 480) + CameraText("topShape", "top") +
                                   "\tsetAttr \".o\" yes;\n" + CameraText("lens", "rig"));
  EXPECT_THAT(LayerNames(run), ElementsAre("lens"));
}

TEST(AssemblyTest, SquarePixelsMakeOneCompositionOfTheScenesSizeRateAndLength) {
  const ImportRun run = ImportText(SceneHead("-t pal") + RenderSize(1280, 544) + TransformText("rig") +
                                   CameraText("lens", "rig") + Animation("rig.tx", {{1, 0}, {50, 1}}));
  const auto& comps = run.host->project().compositions();
  ASSERT_EQ(comps.size(), 1u);
  EXPECT_EQ(comps[0].name, "shot01");
  EXPECT_EQ(comps[0].width, 1280);
  EXPECT_EQ(comps[0].height, 544);
  EXPECT_EQ(comps[0].pixelAspect, (HostRatio{1000, 1000}));
  EXPECT_EQ(comps[0].duration, (T_Time{50000, 25000}));
  EXPECT_EQ(comps[0].frameRate, (HostRatio{25, 1}));
  EXPECT_EQ(run.result.folder->compositions.size(), 1u);
}

TEST(AssemblyTest, AnAspectNearOneCountsAsSquare) {
  const std::string camera = CameraText("lens", "rig");
  const ImportRun square = ImportText(SceneHead() + RenderSize(640, 480, 1.005) + camera);
  EXPECT_THAT(CompNames(square), ElementsAre("shot01"));
  EXPECT_EQ(square.host->project().compositions()[0].pixelAspect, (HostRatio{1000, 1000}));
}

TEST(AssemblyTest, AnAspectOfOnePointNoughtOneIsNotSquare) {
  const ImportRun wide = ImportText(SceneHead() + RenderSize(640, 480, 1.01) + CameraText("lens", "rig"));
  EXPECT_THAT(CompNames(wide), ElementsAre("Square shot01", "shot01"));
  EXPECT_EQ(wide.host->project().compositions()[1].pixelAspect, (HostRatio{1010, 1000}));
}

TEST(AssemblyTest, PixelsThatAreNotSquareNestASquareCompositionInTheDisplayOne) {
  const ImportRun run = ImportText(SceneHead() + RenderSize(720, 486, 0.9) + TransformText("rig") +
                                   CameraText("lens", "rig") + LocatorText("null1", "rig"));
  const auto& comps = run.host->project().compositions();
  ASSERT_EQ(comps.size(), 2u);
  EXPECT_EQ(comps[0].name, "Square shot01");
  EXPECT_EQ(comps[0].width, 648);
  EXPECT_EQ(comps[0].height, 486);
  EXPECT_EQ(comps[0].pixelAspect, (HostRatio{1, 1}));
  EXPECT_EQ(comps[1].name, "shot01");
  EXPECT_EQ(comps[1].width, 720);
  EXPECT_EQ(comps[1].height, 486);
  EXPECT_EQ(comps[1].pixelAspect, (HostRatio{900, 1000}));
  EXPECT_EQ(comps[0].duration, comps[1].duration);
  EXPECT_EQ(comps[0].frameRate, comps[1].frameRate);
  ASSERT_EQ(comps[1].layers.size(), 1u);
  EXPECT_EQ(comps[1].layers[0]->source, &comps[0]);
  EXPECT_EQ(comps[0].layers.size(), 2u);
}

TEST(AssemblyTest, TheCompositionsAreMadeBeforeTheNestingAndTheNestingBeforeTheCameras) {
  const ImportRun run = ImportText(SceneHead() + RenderSize(720, 486, 0.9) + CameraText("lens", ""));
  std::vector<std::string> calls;
  for (const std::string& line : run.trace) {
    const std::string call(Field(line, "call"));
    if (call == "\"CreateComp\"" || call == "\"GetItemFromComp\"" || call == "\"AddLayerFromItem\"" ||
        call == "\"NewCameraLayer\"")
      calls.push_back(call);
  }
  EXPECT_THAT(calls, ElementsAre("\"CreateComp\"", "\"CreateComp\"", "\"GetItemFromComp\"",
                                 "\"AddLayerFromItem\"", "\"NewCameraLayer\""));
}

TEST(AssemblyTest, TheSquareNameComesFromTheHostsTranslations) {
  refhost::HostOptions options;
  options.translations = {{"$$$/QZ/Maya_Import/LStr/0006", "Quadrat"},
                          {"$$$/QZ/Maya_Import/LStr/0007", "^^2 (^^1)"}};
  const ImportRun run = ImportText(SceneHead() + RenderSize(720, 486, 0.9) + CameraText("lens", ""), options);
  EXPECT_THAT(CompNames(run), ElementsAre("shot01 (Quadrat)", "shot01"));
}

TEST(AssemblyTest, TheSquareWidthIsRoundedToTheNearestPixel) {
  constexpr std::pair<int, std::int32_t> kWidths[] = {{721, 865}, {723, 868}};  // 865.2, 867.6
  for (const auto& [width, square] : kWidths) {
    const ImportRun run = ImportText(SceneHead() + RenderSize(width, 486, 1.2) + CameraText("lens", ""));
    EXPECT_EQ(run.host->project().compositions()[0].width, square);
  }
}

TEST(AssemblyTest, TheSquareWidthIsComputedWithoutOverflow) {
  refhost::HostOptions permissive;
  permissive.permissive = true;
  const ImportRun run =
      ImportText(SceneHead() + RenderSize(2000000, 486, 1500) + CameraText("lens", ""), permissive);
  EXPECT_EQ(run.host->project().compositions()[0].width, 2147483647);
}

TEST(AssemblyTest, AnAspectOfZeroOrLessIsNotSquareAndIsPassedOn) {
  refhost::HostOptions permissive;
  permissive.permissive = true;
  const ImportRun run =
      ImportText(SceneHead() + RenderSize(720, 486, -1) + CameraText("lens", ""), permissive);
  ASSERT_EQ(run.host->project().compositions().size(), 2u);
  EXPECT_EQ(run.host->project().compositions()[0].width, -719);  // -720 + 0.5, truncated
  EXPECT_EQ(run.host->project().compositions()[1].pixelAspect, (HostRatio{-1000, 1000}));
}

TEST(AssemblyTest, TheFrameRateFollowsTheTimeUnit) {
  constexpr std::pair<const char*, HostRatio> kRows[] = {
      {"hour", {30, 1}}, {"min", {30, 1}},  {"sec", {30, 1}},   {"millisec", {30, 1}},
      {"game", {15, 1}}, {"film", {24, 1}}, {"pal", {25, 1}},   {"ntsc", {30, 1}},
      {"show", {48, 1}}, {"palf", {50, 1}}, {"ntscf", {60, 1}}, {"23.976fps", {23976, 1000}},
  };
  for (const auto& [unit, expected] : kRows) {
    const ImportRun run =
        ImportText(SceneHead(std::string("-t ") + unit) + RenderSize(640, 480) + CameraText("lens", ""));
    ASSERT_EQ(run.host->project().compositions().size(), 1u) << unit;
    EXPECT_EQ(run.host->project().compositions()[0].frameRate, expected) << unit;
  }
}

TEST(AssemblyTest, ARateOfZeroIsPassedOnToAHostThatTakesIt) {
  refhost::HostOptions permissive;
  permissive.permissive = true;
  const std::string scene = SceneHead("-t 0") + RenderSize(640, 480) + CameraText("lens", "");
  {
    const ImportRun run = ImportText(scene, permissive);
    EXPECT_EQ(run.host->project().compositions()[0].frameRate, (HostRatio{0, 1000}));
  }
  EXPECT_EQ(ImportText(scene).result.code, HOST_ERR_BAD_RATIO);
}

TEST(AssemblyTest, ASceneThatStatesNothingHasTheDefaults) {
  const ImportRun run = ImportText("//Maya ASCII\n" + CameraText("lens", ""));
  const auto& comps = run.host->project().compositions();
  ASSERT_EQ(comps.size(), 2u);
  EXPECT_EQ(comps[1].width, 720);
  EXPECT_EQ(comps[1].height, 486);
  EXPECT_EQ(comps[1].pixelAspect, (HostRatio{909, 1000}));
  EXPECT_EQ(comps[0].width, 654);  // 720 * 909 / 1000 is 654.48
  EXPECT_EQ(comps[1].duration, (T_Time{29970, 2997}));
  EXPECT_EQ(comps[1].frameRate, (HostRatio{30, 1}));
}

TEST(AssemblyTest, TheOffsetOfAnEarlierImportDoesNotReachTheNext) {
  const TemporaryFile late(SceneHead() + RenderSize(640, 480) + TransformText("rig") +
                           CameraText("lens", "rig") + Animation("rig.tx", {{100, 0}, {150, 1}}));
  const ImportRun run = ImportFile(late);
  const refhost::CallbackResult again = run.host->importScene(late.path());
  for (const refhost::CallbackResult* const result : {&run.result, &again}) {
    ASSERT_EQ(result->folder->compositions.size(), 1u);
    EXPECT_EQ(result->folder->compositions[0]->duration, (T_Time{150000, 24000}));
  }
}

TEST(AssemblyTest, TheNameIsTheFilesWithoutItsLastExtension) {
  const std::string scene = SceneHead() + RenderSize(640, 480) + CameraText("lens", "");
  constexpr std::pair<const char*, const char*> kNames[] = {
      {"scene.ma", "scene"}, {"shot.v01.ma", "shot.v01"}, {".ma", ""}, {"plain", "plain"}};
  for (const auto& [file, name] : kNames) {
    const ImportRun run = ImportFile(TemporaryFile(scene, file));
    EXPECT_THAT(CompNames(run), ElementsAre(name));
  }
}

TEST(AssemblyTest, AHostErrorLeavesWhatWasMade) {
  refhost::Failure failure;
  failure.operation = "NewNullLayer";
  failure.code = 4321;
  refhost::HostOptions options;
  options.failures.push_back(failure);
  const ImportRun run =
      ImportText(SceneHead() + RenderSize(640, 480) + TransformText("arm") + TransformText("rig", "arm") +
                     CameraText("lens", "rig") + CameraText("second", "rig"),
                 options);
  EXPECT_EQ(run.result.code, 4321);
  EXPECT_THAT(LayerNames(run), ElementsAre("lens"));
}

}  // namespace
}  // namespace testsupport

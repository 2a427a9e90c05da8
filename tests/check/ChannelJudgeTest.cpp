// The judge of the report: it sees each number of an import that is bent, and each diagnostic that is
// missing.
#include "tests/check/ChannelJudge.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <functional>
#include <set>
#include <string>

#include "tests/check/CheckedText.h"
#include "tests/check/GeneratedScene.h"

namespace check_test {
namespace {

using check::CameOver;
using check::CameOverLayer;
using check::CameOverStream;
using check::Stop;
using diag::Code;

const std::string kKeyedScene = [] {
  return "//Maya ASCII 2018 scene\ncurrentUnit -l centimeter -a degree -t film;\n"
         "createNode transform -n \"rig\";\n\tsetAttr \".t\" -type \"double3\" 3 4 5 ;\n"
         "createNode transform -n \"shotCam\" -p \"rig\";\n\tsetAttr \".r\" -type \"double3\" 10 20 30 ;\n"
         "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n"
         "createNode animCurveTL -n \"moveX\";\n\tsetAttr \".tan\" 2;\n"
         "\tsetAttr -s 3 \".ktv[0:2]\"  1 7 2 9 3 11;\nconnectAttr \"moveX.o\" \"shotCam.tx\";\n"
         "createNode animCurveTU -n \"zoom\";\n\tsetAttr \".tan\" 2;\n"
         "\tsetAttr -s 2 \".ktv[0:1]\"  1 35 2 70;\nconnectAttr \"zoom.o\" \"shotCamShape.fl\";\n"
         "createNode transform -n \"mark\";\n\tsetAttr \".s\" -type \"double3\" 1 2 3 ;\n"
         "createNode locator -n \"mark_nullShape\" -p \"mark\";\n";
}();

std::string Judged(const std::string& text, const CameOver& cameOver, const check::Report& report) {
  Compared compared;
  const PlainScene scene(text);
  return ChannelJudge(scene, cameOver, report, &compared).Run();
}

CameOverLayer* LayerOf(CameOver* cameOver, const std::string& name) {
  for (CameOverLayer& layer : cameOver->layers) {
    if (layer.name == name) return &layer;
  }
  ADD_FAILURE() << name;
  return &cameOver->layers.front();
}

TEST(ChannelJudgeTest, SeesEachNumberThatIsBent) {
  const Checked checked(kKeyedScene);
  ASSERT_EQ(Judged(kKeyedScene, checked.cameOver(), checked.report()), "");
  struct Bend {
    const char* what;
    const char* layer;
    std::function<void(CameOverLayer*)> bend;
  };
  const Bend bends[] = {
      {"a time", "shotCamShape", [](CameOverLayer* layer) { layer->position.times[1] += 0.01; }},
      {"a scale's time", "shotCamShape", [](CameOverLayer* layer) { layer->scale.times[1] += 0.01; }},
      {"an angle's time", "shotCamShape", [](CameOverLayer* layer) { layer->rotateZ.times[1] += 0.01; }},
      {"a key's place", "shotCamShape", [](CameOverLayer* layer) { layer->position.values[4] += 1e-4; }},
      {"a key's angle", "shotCamShape", [](CameOverLayer* layer) { layer->rotateY.values[2] += 1e-4; }},
      {"a zoom", "shotCamShape", [](CameOverLayer* layer) { layer->zoom.values[1] *= 1.002; }},
      {"a zoom's time", "shotCamShape", [](CameOverLayer* layer) { layer->zoom.times[1] += 0.01; }},
      {"a parent", "shotCamShape", [](CameOverLayer* layer) { layer->parent.reset(); }},
      {"what stands still", "rig", [](CameOverLayer* layer) { layer->position.value[2] += 1e-4; }},
      {"a scale", "mark_nullShape", [](CameOverLayer* layer) { layer->scale.value[1] += 1e-4; }},
      {"a name", "mark_nullShape", [](CameOverLayer* layer) { layer->name = "mark_null"; }},
  };
  for (const Bend& one : bends) {
    CameOver bent = checked.cameOver();
    one.bend(LayerOf(&bent, one.layer));
    EXPECT_NE(Judged(kKeyedScene, bent, checked.report()), "") << one.what;
  }
}

TEST(ChannelJudgeTest, MissesEachDiagnosticThatExplainsADifference) {
  const std::set<std::string> wanted = {"LocatorsLeftOut",    "OrthographicCamera",
                                        "StartupCameras",     "ParentIsPath",
                                        "ParentNotImported",  "ChannelsOfOneKey",
                                        "DrivenByNoCurve",    "CurveThroughNode",
                                        "ConnectionToPath",   "LookAtShortNames",
                                        "LookAtWeightLast",   "LookAtNotTaken",
                                        "StoredValueSkipped", "LocatorsWithoutCamera",
                                        "PictureShifts",      "KeysAreNoBake",
                                        "RotateOrderLost",    "RotateAxisLost",
                                        "ShearLost",          "PivotTranslationLost",
                                        "InheritanceOff",     "FitDiffers",
                                        "LensSqueezeLost",    "CameraScaleLost",
                                        "KeysStartApart",     "OtherLengthUnit",
                                        "RateDiffers",        "OffsetMatrixLost",
                                        "LimitLost",          "RadiansLost",
                                        "KeysAtOneTime",      "AimedPivotLost",
                                        "ShiftNotMeasured"};
  std::set<std::string> missed;
  std::uint64_t seed = 0;
  while (missed.size() < wanted.size() && ++seed <= 400) {
    const std::string text = GeneratedScene(seed);
    const Checked checked(text);
    if (checked.cameOver().stop != Stop::None) continue;
    std::set<Code> codes;
    for (const check::Finding& finding : checked.report().findings) codes.insert(finding.diagnostic.code);
    for (const Code code : codes) {
      const std::string symbol(diag::EntryOf(code).symbol);
      if (missed.contains(symbol)) continue;
      check::Report less = checked.report();
      std::erase_if(less.findings,
                    [code](const check::Finding& finding) { return finding.diagnostic.code == code; });
      if (!Judged(text, checked.cameOver(), less).empty()) missed.insert(symbol);
    }
  }
  EXPECT_EQ(missed, wanted) << "after " << seed << " scenes";
}

}  // namespace
}  // namespace check_test

#include "tools/mayascene/CompositionJson.h"

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <sstream>

#include "tests/tools/HandBuiltScene.h"

namespace mayascene {
namespace {

using mayascene_test::HandBuiltScene;
using nlohmann::json;

json documentOf(const RunReport& run) {
  std::ostringstream out;
  writeCompositionJson(out, run);
  return json::parse(out.str());
}

json layersOf(const HandBuiltScene& scene) {
  RunReport run;
  run.scenes.push_back(scene.report);
  return documentOf(run)["scenes"][0]["compositions"][0]["layers"];
}

TEST(CompositionJson, TheFormIsNamedAndNumbered) {
  RunReport run;
  run.linearUnits = 1;
  const json document = documentOf(run);
  EXPECT_EQ(document["format"], "mayascene-composition");
  EXPECT_EQ(document["version"], 1);
  EXPECT_EQ(document["linearUnits"], 1);
  EXPECT_EQ(document["scenes"], json::array());
}

TEST(CompositionJson, ASceneHasItsOwnNumbersWhereTheyAreKnown) {
  RunReport run;
  run.scenes.resize(3);
  run.scenes[0].numbers = SceneNumbers{.firstFrame = 101.0, .lastFrame = 140.5, .linearUnit = "meter"};
  run.scenes[1].numbers = SceneNumbers{.firstFrame = {}, .lastFrame = {}, .linearUnit = "ft"};
  const json scenes = documentOf(run)["scenes"];
  EXPECT_EQ(scenes[0]["firstFrame"], 101);
  EXPECT_EQ(scenes[0]["lastFrame"], 140.5);
  EXPECT_EQ(scenes[0]["linearUnit"], "meter");
  EXPECT_FALSE(scenes[1].contains("firstFrame"));
  EXPECT_FALSE(scenes[1].contains("lastFrame"));
  EXPECT_EQ(scenes[1]["linearUnit"], "ft");
  EXPECT_FALSE(scenes[2].contains("linearUnit"));
}

TEST(CompositionJson, ACompositionHasItsMeasures) {
  const HandBuiltScene scene;
  RunReport run;
  run.scenes.push_back(scene.report);
  json composition = documentOf(run)["scenes"][0]["compositions"][0];
  composition.erase("layers");
  EXPECT_EQ(composition, json::parse(R"({"number": 1, "name": "crane", "width": 1920, "height": 1080,
      "pixelAspect": [1000, 1000], "frameRate": [24, 1], "duration": [48000, 24000]})"));
}

TEST(CompositionJson, ALayerHasKindParentFlagsAndFilmSize) {
  const HandBuiltScene scene;
  json camera = layersOf(scene)[0];
  camera.erase("streams");
  EXPECT_EQ(camera, json::parse(R"({"number": 1, "kind": "camera", "name": "shotcamShape", "parent": 2,
      "source": null, "threeDimensional": false, "aimed": true,
      "filmSize": {"direction": "vertical", "points": 36}})"));
  json arm = layersOf(scene)[1];
  arm.erase("streams");
  EXPECT_EQ(arm, json::parse(R"({"number": 2, "kind": "null", "name": "arm", "parent": 3, "source": null,
      "threeDimensional": true, "aimed": false, "filmSize": null})"));
}

TEST(CompositionJson, ANestedCompositionNamesItsSource) {
  HandBuiltScene scene;
  scene.layers[2].kind = refhost::LayerKind::Composition;
  scene.layers[2].source = &scene.composition;
  const json layer = layersOf(scene)[2];
  EXPECT_EQ(layer["kind"], "composition");
  EXPECT_EQ(layer["source"], 1);
}

TEST(CompositionJson, KeysAreColumnsBesideTheStaticValue) {
  const HandBuiltScene scene;
  EXPECT_EQ(layersOf(scene)[1]["streams"][1], json::parse(R"({"id": 1, "name": "position", "unit": "points",
      "value": [0, 0, 0], "keys": {"times": [[0, 24000], [24000, 24000], [47000, 24000]],
      "values": [[0, 1, 2], [3, 4, 5], [6, 7, 0.1]]}})"));
  EXPECT_EQ(layersOf(scene)[0]["streams"][6], json::parse(R"({"id": 11, "name": "zoom", "unit": "pixels",
      "value": [2057.38625], "keys": {"times": [[0, 24000]], "values": [[2100.5]]}})"));
}

TEST(CompositionJson, EachStreamHasNameAndUnit) {
  const HandBuiltScene scene;
  const json layers = layersOf(scene);
  std::string words;
  for (const json& stream : layers[0]["streams"]) {
    words += std::to_string(stream["id"].get<int>()) + ' ' + stream["name"].get<std::string>() + ' ' +
             stream["unit"].get<std::string>() + '\n';
  }
  EXPECT_EQ(words,
            "0 pointOfInterest points\n1 position points\n2 scale percent\n3 zRotation degrees\n"
            "8 xRotation degrees\n9 yRotation degrees\n11 zoom pixels\n");
  EXPECT_EQ(layers[1]["streams"][0]["name"], "anchorPoint");
}

TEST(CompositionJson, WhatCameOfACallbackIsReportedInFull) {
  RunReport run;
  SceneReport& scene = run.scenes.emplace_back();
  scene.path = "a\xff.ma";
  scene.outcome = Outcome::Failed;
  scene.status = ExitStatus::Refused;
  scene.result.code = 2021;
  scene.result.line = 12;
  scene.result.messages = {"first", "second"};
  scene.result.refusals = {"CreateComp: a width of 0"};
  scene.result.leftovers = {{"stream:3", false}, {"file:1", true}};
  run.deathHook.code = 77;
  const json document = documentOf(run);
  EXPECT_EQ(document["scenes"][0], json::parse(R"({"path": "a\ufffd.ma", "outcome": "failed", "status": 1,
      "error": {"code": 2021, "name": "FILE_OPEN",
                "meaning": "the file cannot be opened, or is not a regular file", "line": 12},
      "messages": ["first", "second"], "refusals": ["CreateComp: a width of 0"],
      "leftovers": [{"description": "stream:3", "keptByDesign": false},
                    {"description": "file:1", "keptByDesign": true}],
      "compositions": []})"));
  EXPECT_EQ(document["entry"],
            json::parse(R"({"error": null, "messages": [], "refusals": [], "leftovers": []})"));
  EXPECT_EQ(document["deathHook"]["error"],
            json::parse(R"({"code": 77, "name": "", "meaning": "", "line": null})"));
}

TEST(CompositionJson, EachOutcomeHasItsWord) {
  RunReport run;
  for (const Outcome outcome :
       {Outcome::Imported, Outcome::Nothing, Outcome::Refused, Outcome::Failed, Outcome::Unreadable}) {
    run.scenes.emplace_back().outcome = outcome;
  }
  const json document = documentOf(run);
  std::string words;
  for (const json& scene : document["scenes"]) words += scene["outcome"].get<std::string>() + ' ';
  EXPECT_EQ(words, "imported nothing refused failed unreadable ");
}

}  // namespace
}  // namespace mayascene

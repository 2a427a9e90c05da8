// Rigs of the scene's own: joints, controls that turn them through constraints, driven curves, skins.
#include <algorithm>
#include <array>

#include "bench/SceneParts.h"
#include "bench/ShotParts.h"

namespace bench {
namespace {

std::string rigName(std::int64_t rig) { return numbered("rig", rig); }

std::string jointName(std::int64_t rig, std::int64_t joint) {
  return rigName(rig) + numbered("_joint_", joint);
}

std::string controlName(std::int64_t rig, std::int64_t joint) {
  return rigName(rig) + numbered("_ctrl_", joint);
}

std::string constraintName(std::int64_t rig, std::int64_t joint) {
  return jointName(rig, joint) + "_parentConstraint1";
}

std::string drivenCurveName(std::int64_t rig, std::int64_t joint) { return jointName(rig, joint) + "_bulge"; }

std::string skinName(std::int64_t rig) { return rigName(rig) + "_skinCluster"; }

void matrix(SceneText& scene) {
  for (int i = 0; i < 16; ++i) scene.text(" ").real(i == 15 ? 1.0 : scene.number(1), 16);
}

void joint(SceneText& scene, std::int64_t rig, std::int64_t number) {
  constexpr std::int64_t kInLimb = 8;
  scene.node("joint", jointName(rig, number),
             number % kInLimb == 0 ? rigName(rig) : jointName(rig, number - 1));
  scene.text("\taddAttr -ci true -sn \"liw\" -ln \"lockInfluenceWeights\" -min 0 -max 1 -at \"bool\";\n");
  scene.triple(".t", scene.number(10), 0, 0, 15)
      .text("\tsetAttr \".mnrl\" -type \"double3\" -360 -360 -360 ;\n");
  scene.triple(".jo", 0, 0, scene.number(90), 14).text("\tsetAttr \".ssc\" no;\n");
  scene.text("\tsetAttr \".bps\" -type \"matrix\"");
  matrix(scene);
  scene.text(";\n\tsetAttr \".radi\" 0.5;\n");
}

void control(SceneText& scene, std::int64_t rig, std::int64_t number) {
  constexpr int kPoints = 11;
  const std::string name = controlName(rig, number);
  transform(scene, name + "_grp", rigName(rig));
  transform(scene, name, name + "_grp");
  scene.text("\taddAttr -ci true -k true -sn \"bulge\" -ln \"bulge\" -min 0 -max 10 -at \"double\";\n");
  for (const Channel& channel : kChannels) {
    if (channel.attribute[0] == 's')
      scene.text("\tsetAttr -l on -k off \".").text(channel.attribute).text("\";\n");
  }
  scene.text("\tsetAttr -k on \".bulge\";\n");
  scene.node("nurbsCurve", name + "Shape", name).text("\tsetAttr -k off \".v\";\n\tsetAttr \".tw\" yes;\n");
  scene.text(
      "\tsetAttr \".cc\" -type \"nurbsCurve\" \n\t\t3 8 2 no 3\n\t\t13 -2 -1 0 1 2 3 4 5 6 7 8 9 "
      "10\n\t\t11\n");
  for (int i = 0; i < kPoints; ++i) {
    scene.text("\t\t").real(scene.number(1), 16).text(" ").real(scene.number(1), 16).text(" ");
    scene.real(scene.number(1), 16).text("\n");
  }
  scene.text("\t\t;\n");
}

void constraint(SceneText& scene, std::int64_t rig, std::int64_t number) {
  scene.node("parentConstraint", constraintName(rig, number), jointName(rig, number));
  scene.text("\taddAttr -dcb 0 -ci true -k true -sn \"w0\" -ln \"").text(controlName(rig, number));
  scene.text(
      "W0\" -dv 1 -min 0 \n\t\t-at \"double\";\n\tsetAttr -k on \".nds\";\n\tsetAttr -k off \".v\";\n");
  for (const Channel& channel : kChannels)
    scene.text("\tsetAttr -k off \".").text(channel.attribute).text("\";\n");
  scene.text("\tsetAttr \".erp\" yes;\n");
  scene.triple(".tg[0].tot", 0, scene.number(10), 0, 15).triple(".lr", scene.number(90), 0, 0, 14);
  scene.text("\tsetAttr -k on \".w0\";\n");
}

// A value by a control's value, not by the time.
void drivenCurve(SceneText& scene, std::int64_t rig, std::int64_t number) {
  scene.node("animCurveUU", drivenCurveName(rig, number))
      .text("\tsetAttr \".tan\" 18;\n\tsetAttr \".wgt\" no;\n");
  scene.text("\tsetAttr -s 3 \".ktv[0:2]\"  0 0 5 ").real(scene.number(1), 15).text(" 10 1;\n");
}

void skin(SceneText& scene, std::int64_t rig, const ShotSize& size) {
  scene.node("skinCluster", skinName(rig)).text("\tsetAttr -s ").integer(size.skinPoints).text(" \".wl\";\n");
  for (std::int64_t first = 0; first < size.skinPoints; first += 500) {
    const std::int64_t last = std::min(size.skinPoints, first + 500) - 1;
    scene.text("\tsetAttr \".wl[").integer(first).text(":").integer(last).text("].w\"");
    for (std::int64_t point = first; point <= last; ++point) {
      scene.text("\n\t\t2 ").integer(scene.below(size.joints)).text(" ").real(scene.number(0.5) + 0.5, 16);
      scene.text(" ").integer(size.joints).text(" ").real(scene.number(0.5) + 0.5, 16);
    }
    scene.text(";\n");
  }
  scene.text("\tsetAttr -s ").integer(size.joints).text(" \".pm\";\n");
  for (std::int64_t j = 0; j < size.joints; ++j) {
    scene.text("\tsetAttr \".pm[").integer(j).text("]\" -type \"matrix\"");
    matrix(scene);
    scene.text(";\n");
  }
  scene.text("\tsetAttr \".mi\" 4;\n\tsetAttr \".ucm\" yes;\n");
}

void connectJoint(SceneText& scene, std::int64_t rig, std::int64_t number) {
  constexpr std::array<std::array<std::string_view, 2>, 5> kTarget = {
      {{".t", "tt"}, {".rp", "trp"}, {".rpt", "trt"}, {".r", "tr"}, {".ro", "tro"}}};
  constexpr std::array<std::array<std::string_view, 2>, 6> kResult = {
      {{".ctx", ".tx"}, {".cty", ".ty"}, {".ctz", ".tz"}, {".crx", ".rx"}, {".cry", ".ry"}, {".crz", ".rz"}}};
  const std::string bone = jointName(rig, number);
  const std::string holder = constraintName(rig, number);
  const std::string handle = controlName(rig, number);
  for (const auto& [from, to] : kResult) scene.connect(holder + std::string(from), bone + std::string(to));
  for (const auto& [from, to] : kTarget) {
    scene.connect(handle + std::string(from), holder + ".tg[0]." + std::string(to));
  }
  scene.connect(handle + ".pm", holder + ".tg[0].tpm");
  scene.connect(holder + ".w0", holder + ".tg[0].tw");
  scene.connect(handle + ".bulge", drivenCurveName(rig, number) + ".i");
  scene.connect(drivenCurveName(rig, number) + ".o", bone + ".sy");
  const std::string index = '[' + std::to_string(number) + ']';
  scene.connect(bone + ".wm", skinName(rig) + ".ma" + index);
  scene.connect(bone + ".liw", skinName(rig) + ".lw" + index);
}

template <typename Each>
void eachJoint(const ShotSize& size, std::int64_t rig, Each each) {
  for (std::int64_t j = 0; j < size.joints; ++j) each(rig, j);
}

}  // namespace

void rigNodes(SceneText& scene, const ShotSize& size) {
  for (std::int64_t r = 0; r < size.rigs; ++r) {
    transform(scene, rigName(r));
    eachJoint(size, r, [&](std::int64_t rig, std::int64_t j) {
      joint(scene, rig, j);
      constraint(scene, rig, j);
      control(scene, rig, j);
    });
  }
}

void rigSkins(SceneText& scene, const ShotSize& size) {
  for (std::int64_t r = 0; r < size.rigs; ++r) {
    skin(scene, r, size);
    eachJoint(size, r, [&](std::int64_t rig, std::int64_t j) { drivenCurve(scene, rig, j); });
  }
}

void rigConnections(SceneText& scene, const ShotSize& size) {
  for (std::int64_t r = 0; r < size.rigs; ++r) {
    eachJoint(size, r, [&](std::int64_t rig, std::int64_t j) { connectJoint(scene, rig, j); });
  }
}

}  // namespace bench

#include "bench/SceneGenerator.h"

#include <algorithm>
#include <array>

#include "bench/SceneText.h"

namespace bench {
namespace {

struct Channel {
  std::string_view attribute;
  std::string_view suffix;
  std::string_view curveType;
};

constexpr std::array<Channel, 9> kChannels = {{
    {"tx", "translateX", "animCurveTL"},
    {"ty", "translateY", "animCurveTL"},
    {"tz", "translateZ", "animCurveTL"},
    {"rx", "rotateX", "animCurveTA"},
    {"ry", "rotateY", "animCurveTA"},
    {"rz", "rotateZ", "animCurveTA"},
    {"sx", "scaleX", "animCurveTU"},
    {"sy", "scaleY", "animCurveTU"},
    {"sz", "scaleZ", "animCurveTU"},
}};

std::int64_t scaled(double scale, double count) { return static_cast<std::int64_t>(count * scale + 0.5); }

std::string numbered(std::string_view stem, std::int64_t number) {
  return std::string(stem) + std::to_string(number);
}

void transform(SceneText& scene, const std::string& name, const std::string& parent) {
  scene.text("createNode transform -n \"").text(name).text("\"");
  if (!parent.empty()) scene.text(" -p \"").text(parent).text("\"");
  scene.text(";\n\tsetAttr \".t\" -type \"double3\" ");
  scene.real(scene.number(100), 6).text(" ").real(scene.number(100), 6).text(" ").real(scene.number(100), 6);
  scene.text(" ;\n");
}

void camera(SceneText& scene, const std::string& name) {
  transform(scene, name, "");
  scene.text("createNode camera -n \"").text(name).text("Shape\" -p \"").text(name).text("\";\n");
  scene.text(
      "\tsetAttr -k off \".v\";\n\tsetAttr \".fl\" 35;\n\tsetAttr \".cap\" -type \"double2\" 1.417 0.945 "
      ";\n");
}

// Curves for the channels of a node, then their connections.
void animate(SceneText& scene, const std::string& node, int keys, int decimals, std::size_t firstChannel,
             std::size_t channelCount) {
  for (std::size_t c = firstChannel; c < firstChannel + channelCount; ++c) {
    const std::string curve = node + "_" + std::string(kChannels[c].suffix);
    scene.curve(kChannels[c].curveType, curve, keys, decimals, 100.0);
  }
  for (std::size_t c = firstChannel; c < firstChannel + channelCount; ++c) {
    const std::string curve = node + "_" + std::string(kChannels[c].suffix);
    scene.connect(curve + ".o", node + "." + std::string(kChannels[c].attribute));
  }
}

// Rows of numbers as a mesh attribute holds them, in runs of `perCommand` elements.
void meshRows(SceneText& scene, std::string_view attribute, std::int64_t count, std::int64_t perCommand,
              void (*element)(SceneText&, std::int64_t)) {
  for (std::int64_t first = 0; first < count; first += perCommand) {
    const std::int64_t last = std::min(count, first + perCommand) - 1;
    scene.text("\tsetAttr \"").text(attribute).text("[").integer(first).text(":").integer(last).text("]\" ");
    for (std::int64_t i = first; i <= last; ++i) {
      scene.text(i % 4 == 3 ? "\n\t\t" : " ");
      element(scene, i);
    }
    scene.text(";\n");
  }
}

void threeReals(SceneText& scene, std::int64_t) {
  scene.real(scene.number(50), 7).text(" ").real(scene.number(50), 7).text(" ").real(scene.number(50), 7);
}

void twoReals(SceneText& scene, std::int64_t) {
  scene.real(scene.number(1), 8).text(" ").real(scene.number(1), 8);
}

void edge(SceneText& scene, std::int64_t i) {
  scene.integer(i).text(" ").integer(i + 1 + scene.below(300)).text(" 0");
}

void face(SceneText& scene, std::int64_t i) {
  scene.text("f 4 ").integer(i).text(" ").integer(i + 1).text(" ").integer(-i - 5).text(" ").integer(-i);
  scene.text("\n\t\tmu 0 4 ")
      .integer(i)
      .text(" ")
      .integer(i + 1)
      .text(" ")
      .integer(i + 7)
      .text(" ")
      .integer(i + 6);
}

void mesh(SceneText& scene, const std::string& name, std::int64_t vertices) {
  transform(scene, name, "");
  scene.text("createNode mesh -n \"").text(name).text("Shape\" -p \"").text(name).text("\";\n");
  scene.text("\tsetAttr -k off \".v\";\n\tsetAttr \".uvst[0].uvsn\" -type \"string\" \"map1\";\n");
  meshRows(scene, ".uvst[0].uvsp", vertices, 250, twoReals);
  meshRows(scene, ".vt", vertices, 166, threeReals);
  meshRows(scene, ".ed", vertices * 2, 166, edge);
  meshRows(scene, ".n", vertices * 2, 166, threeReals);
  constexpr std::int64_t kFacesPerCommand = 500;
  for (std::int64_t first = 0; first < vertices; first += kFacesPerCommand) {
    const std::int64_t count = std::min(kFacesPerCommand, vertices - first);
    scene.text("\tsetAttr -s ")
        .integer(count)
        .text(" \".fc[")
        .integer(first)
        .text(":")
        .integer(first + count - 1);
    scene.text("]\" -type \"polyFaces\" ");
    for (std::int64_t i = first; i < first + count; ++i) {
      scene.text("\n\t\t");
      face(scene, i);
    }
    scene.text(";\n");
  }
}

void writeMesh(std::ostream& out, double scale, std::uint64_t seed) {
  SceneText scene(out, seed);
  scene.header("film");
  const std::int64_t vertices = scaled(scale, 10500);
  for (int i = 0; i < 90; ++i) mesh(scene, numbered("mesh", i), vertices);
  for (int i = 0; i < 4; ++i) {
    const std::string name = numbered("camera", i);
    camera(scene, name);
    animate(scene, name, 240, 9, 0, 6);
  }
  scene.footer();
}

void writeKeys(std::ostream& out, double scale, std::uint64_t seed) {
  SceneText scene(out, seed);
  scene.header("film");
  camera(scene, "camera0");
  const std::int64_t count = scaled(scale, 3000);
  for (std::int64_t i = 0; i < count; ++i) {
    const std::string name = numbered("joint", i);
    transform(scene, name, i % 10 == 0 ? std::string() : numbered("joint", i - 1));
    animate(scene, name, 240, 10, 0, 9);
  }
  scene.footer();
}

void writeNodes(std::ostream& out, double scale, std::uint64_t seed) {
  SceneText scene(out, seed);
  scene.header("pal");
  camera(scene, "camera0");
  const std::int64_t transforms = scaled(scale, 120000);
  const std::int64_t locators = scaled(scale, 80000);
  const std::int64_t curves = scaled(scale, 10000);
  const std::int64_t connections = scaled(scale, 200000);
  for (std::int64_t i = 0; i < transforms; ++i) {
    transform(scene, numbered("crowd_group_", i),
              i % 8 == 0 ? std::string() : numbered("crowd_group_", i - 1));
    scene.text("\tsetAttr \".r\" -type \"double3\" 0 ").real(scene.number(180), 4).text(" 0 ;\n");
    scene.text("\tsetAttr \".rp\" -type \"double3\" 0 ").real(scene.number(2), 4).text(" 0 ;\n");
    if (i < locators) {
      scene.text("createNode locator -n \"").text(numbered("crowd_locatorShape_", i)).text("\" -p \"");
      scene.text(numbered("crowd_group_", i)).text("\";\n\tsetAttr -k off \".v\";\n");
      scene.text("\tsetAttr \".los\" -type \"double3\" 0.5 0.5 0.5 ;\n");
    }
  }
  for (std::int64_t i = 0; i < curves; ++i) {
    scene.curve("animCurveTL", numbered("crowd_curve_", i), 4, 5, 100.0);
  }
  for (std::int64_t i = 0; i < connections; ++i) {
    const std::string destination = numbered("crowd_group_", scene.below(transforms)) + ".";
    const Channel& channel = kChannels[static_cast<std::size_t>(i % 9)];
    if (i % 2 == 0) {
      scene.connect(numbered("crowd_curve_", scene.below(curves)) + ".o",
                    destination + std::string(channel.attribute));
    } else {
      scene.connect(numbered("crowd_group_", scene.below(transforms)) + ".msg", destination + "dispLayer");
    }
  }
  scene.footer();
}

void writeComposition(std::ostream& out, double scale, std::uint64_t seed) {
  SceneText scene(out, seed);
  scene.header("film");
  camera(scene, "camera0");
  const std::int64_t count = scaled(scale, 1000);
  for (std::int64_t i = 0; i < count; ++i) {
    const std::string name = numbered("marker", i);
    transform(scene, name, "");
    scene.text("createNode locator -n \"").text(name).text("_nullShape\" -p \"").text(name).text("\";\n");
    const auto channel = static_cast<std::size_t>(i % 6);
    const std::string curve = name + "_" + std::string(kChannels[channel].suffix);
    scene.curve(kChannels[channel].curveType, curve, 1200, 14, 100.0);
    scene.tangents(1200);
    scene.connect(curve + ".o", name + "." + std::string(kChannels[channel].attribute));
  }
  scene.footer();
}

}  // namespace

const Workload kWorkloads[4] = {
    {"mesh", "90 meshes and four baked cameras", writeMesh},
    {"keys", "3000 transforms with nine curves of 240 keys each", writeKeys},
    {"nodes", "120,000 transforms, 80,000 locators, 10,000 curves, 200,000 connections", writeNodes},
    {"composition", "1000 transforms with one curve of 1200 keys and a null locator each", writeComposition},
};

const Workload* findWorkload(std::string_view name) {
  for (const Workload& workload : kWorkloads) {
    if (workload.name == name) return &workload;
  }
  return nullptr;
}

}  // namespace bench

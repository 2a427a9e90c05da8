#include "bench/SceneParts.h"

#include <algorithm>

namespace bench {
namespace {

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
  scene.text("\n\t\tmu 0 4 ").integer(i).text(" ").integer(i + 1);
  scene.text(" ").integer(i + 7).text(" ").integer(i + 6);
}

void faces(SceneText& scene, std::int64_t count) {
  constexpr std::int64_t kPerCommand = 500;
  for (std::int64_t first = 0; first < count; first += kPerCommand) {
    const std::int64_t inCommand = std::min(kPerCommand, count - first);
    scene.text("\tsetAttr -s ").integer(inCommand).text(" \".fc[").integer(first).text(":");
    scene.integer(first + inCommand - 1).text("]\" -type \"polyFaces\" ");
    for (std::int64_t i = first; i < first + inCommand; ++i) {
      scene.text("\n\t\t");
      face(scene, i);
    }
    scene.text(";\n");
  }
}

}  // namespace

std::int64_t scaled(double scale, double count, std::int64_t least) {
  return std::max(least, static_cast<std::int64_t>(count * scale + 0.5));
}

std::string numbered(std::string_view stem, std::int64_t number) {
  return std::string(stem) + std::to_string(number);
}

void transform(SceneText& scene, std::string_view name, std::string_view parent) {
  scene.node("transform", name, parent);
  const double x = scene.number(100);
  const double y = scene.number(100);
  scene.triple(".t", x, y, scene.number(100), 6);
}

void locator(SceneText& scene, std::string_view name, std::string_view parent) {
  scene.node("locator", name, parent).text("\tsetAttr -k off \".v\";\n");
}

void camera(SceneText& scene, const std::string& name, std::string_view parent) {
  transform(scene, name, parent);
  scene.node("camera", name + "Shape", name);
  scene.text("\tsetAttr -k off \".v\";\n\tsetAttr \".fl\" 35;\n");
  scene.text("\tsetAttr \".cap\" -type \"double2\" 1.417 0.945 ;\n");
}

void animate(SceneText& scene, const std::string& node, int keys, int decimals, std::size_t firstChannel,
             std::size_t channelCount) {
  const auto curve = [&node](std::size_t channel) {
    return node + "_" + std::string(kChannels[channel].suffix);
  };
  const std::size_t end = firstChannel + channelCount;
  for (std::size_t c = firstChannel; c < end; ++c) {
    scene.curve(kChannels[c].curveType, curve(c), keys, decimals, 100.0);
  }
  for (std::size_t c = firstChannel; c < end; ++c) {
    scene.connect(curve(c) + ".o", node + "." + std::string(kChannels[c].attribute));
  }
}

void mesh(SceneText& scene, const std::string& name, std::int64_t vertices) {
  transform(scene, name);
  scene.node("mesh", name + "Shape", name);
  scene.text("\tsetAttr -k off \".v\";\n\tsetAttr \".uvst[0].uvsn\" -type \"string\" \"map1\";\n");
  meshRows(scene, ".uvst[0].uvsp", vertices, 250, twoReals);
  meshRows(scene, ".vt", vertices, 166, threeReals);
  meshRows(scene, ".ed", vertices * 2, 166, edge);
  meshRows(scene, ".n", vertices * 2, 166, threeReals);
  faces(scene, vertices);
}

}  // namespace bench

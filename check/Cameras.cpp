#include "check/Cameras.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <deque>
#include <unordered_map>

#include "text/Letters.h"

namespace check {
namespace {

// The types that the importer keeps as transforms.
constexpr std::array<std::string_view, 4> kTransformTypes = {"transform", "stereoRigTransform", "lookAt",
                                                             "aimConstraint"};

char Lower(char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; }

bool IsCamera(const scene::Node& node) {
  return node.origin == scene::Origin::Created &&
         (SameName(node.type, "camera") || SameName(node.type, "stereoRigCamera"));
}

// Whether the importer passes over the camera. It knows an orthographic one by the word "yes" alone.
bool IsSkipped(const scene::Scene& scene, scene::NodeId id) {
  if (SameName(ImportName(scene, scene.node(id)), "perspShape")) return true;
  const std::optional<scene::Value> orthographic = scene.Written(id, "orthographic");
  return orthographic && SameName(orthographic->text(), "yes");
}

}  // namespace

bool SameName(std::string_view a, std::string_view b) {
  return a.size() == b.size() &&
         std::equal(a.begin(), a.end(), b.begin(), [](char x, char y) { return Lower(x) == Lower(y); });
}

bool IsImportedTransform(std::string_view type) {
  return std::any_of(kTransformTypes.begin(), kTransformTypes.end(),
                     [type](std::string_view one) { return SameName(one, type); });
}

std::vector<Camera> FindCameras(const scene::Scene& scene, const CameOver& cameOver) {
  // The import makes the layers of the cameras in the order of the file, each under the camera's name. Where
  // names differ in case alone, all their layers can have the same one.
  std::unordered_map<std::string, std::deque<const CameOverLayer*>> layersOf;
  for (const CameOverLayer& layer : cameOver.layers) {
    if (layer.kind == LayerKind::Camera) layersOf[text::Lowered(layer.name)].push_back(&layer);
  }
  const auto takeLayer = [&](Camera* camera) {
    const auto known = layersOf.find(text::Lowered(ImportName(scene, scene.node(camera->shape))));
    if (known == layersOf.end() || known->second.empty()) return;
    camera->layer = known->second.front();
    known->second.pop_front();
  };
  std::vector<Camera> cameras;
  for (scene::NodeId id = 0; id < scene.nodes().size(); ++id) {
    const scene::Node& node = scene.node(id);
    if (!IsCamera(node)) continue;
    cameras.push_back(
        {.shape = id, .transform = node.parent, .layer = nullptr, .taken = !IsSkipped(scene, id)});
    if (cameras.back().taken) takeLayer(&cameras.back());
  }
  // Where the file creates a camera twice, the import has two. Only one of them has the values.
  for (Camera& camera : cameras) {
    if (camera.taken) continue;
    takeLayer(&camera);
    camera.taken = camera.layer != nullptr;
  }
  return cameras;
}

}  // namespace check

#include "check/LookAts.h"

#include <algorithm>
#include <unordered_map>
#include <unordered_set>

namespace check {
namespace {

// The importer finds it anywhere in the attribute.
constexpr std::string_view kTarget = "target";

// The attribute of a plug as the file has it.
std::string_view WrittenAttribute(const scene::Scene& scene, const diag::Range& plug) {
  const std::string_view text =
      scene.text().substr(static_cast<std::size_t>(plug.offset), static_cast<std::size_t>(plug.length));
  const std::size_t dot = text.find('.');
  return dot == std::string_view::npos ? std::string_view() : text.substr(dot + 1);
}

LookAt WiringOf(const scene::Scene& scene, scene::NodeId lookAt,
                const std::unordered_map<scene::NodeId, const Camera*>& cameraOf) {
  LookAt wiring{.node = lookAt};
  for (const scene::Connection* const connection : scene.ConnectionsFrom(lookAt)) {
    if (!connection->destination.attribute.starts_with("rotate")) continue;
    wiring.turned = connection->destination.node;
    const auto camera = cameraOf.find(wiring.turned);
    if (camera != cameraOf.end()) wiring.camera = camera->second;
    break;
  }
  return wiring;
}

// The node that the importer takes for the target: the last one of a transform's type that is connected.
scene::NodeId TargetOf(const scene::Scene& scene, scene::NodeId lookAt) {
  scene::NodeId target = scene::kNoNode;
  for (const scene::Connection* const connection : TargetsOf(scene, lookAt)) {
    if (IsImportedTransform(scene.node(connection->source.node).type)) target = connection->source.node;
  }
  return target;
}

// By transform: the first camera below it that came over, or the first one where none did.
std::unordered_map<scene::NodeId, const Camera*> CamerasByTransform(const std::vector<Camera>& cameras) {
  std::unordered_map<scene::NodeId, const Camera*> cameraOf;
  for (const Camera& camera : cameras) {
    const Camera*& kept = cameraOf.try_emplace(camera.transform, &camera).first->second;
    if (kept->layer == nullptr) kept = &camera;
  }
  cameraOf.erase(scene::kNoNode);
  return cameraOf;
}

}  // namespace

bool IsLookAt(std::string_view type) { return SameName(type, "lookAt") || SameName(type, "aimConstraint"); }

std::vector<const scene::Connection*> TargetsOf(const scene::Scene& scene, scene::NodeId lookAt) {
  std::vector<const scene::Connection*> targets = scene.ConnectionsInto(lookAt);
  std::erase_if(targets, [&scene](const scene::Connection* connection) {
    return WrittenAttribute(scene, connection->destinationPlace).find(kTarget) == std::string_view::npos;
  });
  std::stable_sort(targets.begin(), targets.end(), [](const auto* one, const auto* other) {
    return one->destinationPlace.offset < other->destinationPlace.offset;
  });
  return targets;
}

std::vector<LookAt> FindLookAts(const scene::Scene& scene, const std::vector<Camera>& cameras) {
  const auto cameraOf = CamerasByTransform(cameras);
  std::vector<LookAt> lookAts;
  for (scene::NodeId id = 0; id < scene.nodes().size(); ++id) {
    const scene::Node& node = scene.node(id);
    if (node.origin == scene::Origin::Created && IsLookAt(node.type))
      lookAts.push_back(WiringOf(scene, id, cameraOf));
  }
  std::stable_partition(lookAts.begin(), lookAts.end(),
                        [](const LookAt& one) { return one.camera != nullptr; });
  // Where several turn one camera, the first that has a target aims it.
  std::unordered_set<const Camera*> aimed;
  for (LookAt& one : lookAts) {
    const bool mayAim = one.camera != nullptr && one.camera->layer != nullptr && one.camera->layer->aimed &&
                        !aimed.contains(one.camera);
    if (mayAim) one.target = TargetOf(scene, one.node);
    if (one.target != scene::kNoNode) aimed.insert(one.camera);
  }
  return lookAts;
}

}  // namespace check

// The look-ats in the head, and the cameras that the import aims by them.
#include <algorithm>
#include <unordered_map>
#include <unordered_set>

#include "check/HeadInternal.h"
#include "check/LookAts.h"

namespace check {
namespace {

using scene::NodeId;

// What a look-at is wired to.
struct Wiring {
  NodeId lookAt = scene::kNoNode;
  NodeId turned = scene::kNoNode;  // kNoNode: nothing
  const Camera* camera = nullptr;  // whose transform it turns; null: none
};

Wiring WiringOf(const scene::Scene& scene, NodeId lookAt,
                const std::unordered_map<NodeId, const Camera*>& cameraOf) {
  Wiring wiring{.lookAt = lookAt};
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
NodeId TargetOf(const scene::Scene& scene, NodeId lookAt) {
  NodeId target = scene::kNoNode;
  for (const scene::Connection* const connection : TargetsOf(scene, lookAt)) {
    if (IsImportedTransform(scene.node(connection->source.node).type)) target = connection->source.node;
  }
  return target;
}

// By transform, the first camera under it that came over; without any, the first.
std::unordered_map<NodeId, const Camera*> CamerasByTransform(const std::vector<Camera>& cameras) {
  std::unordered_map<NodeId, const Camera*> cameraOf;
  for (const Camera& camera : cameras) {
    const Camera*& kept = cameraOf.try_emplace(camera.transform, &camera).first->second;
    if (kept->layer == nullptr) kept = &camera;
  }
  cameraOf.erase(scene::kNoNode);
  return cameraOf;
}

}  // namespace

void DescribeLookAts(const HeadSource& source, Head* head) {
  const scene::Scene& scene = source.scene;
  const auto cameraOf = CamerasByTransform(source.cameras);
  std::vector<Wiring> wirings;
  for (NodeId id = 0; id < scene.nodes().size(); ++id) {
    const scene::Node& node = scene.node(id);
    if (node.origin == scene::Origin::Created && IsLookAt(node.type))
      wirings.push_back(WiringOf(scene, id, cameraOf));
  }
  std::stable_partition(wirings.begin(), wirings.end(),
                        [](const Wiring& one) { return one.camera != nullptr; });
  // Where several turn one camera, the first that has a target aims it.
  std::unordered_set<const Camera*> aimed;
  for (const Wiring& wiring : wirings) {
    const bool mayAim = wiring.camera != nullptr && wiring.camera->layer != nullptr &&
                        wiring.camera->layer->aimed && !aimed.contains(wiring.camera);
    const NodeId target = mayAim ? TargetOf(scene, wiring.lookAt) : scene::kNoNode;
    if (target != scene::kNoNode) aimed.insert(wiring.camera);
    AddOrCount(source, &head->lookAts, &head->lookAtsNotShown, [&] {
      const scene::Node& node = scene.node(wiring.lookAt);
      LookAtHead lookAt{std::string(node.name), WhereIs(node.place, source.lines), {}, {}, {}};
      if (wiring.turned != scene::kNoNode) lookAt.turns = scene.node(wiring.turned).name;
      if (target == scene::kNoNode) return lookAt;
      lookAt.camera = scene.node(wiring.camera->shape).name;
      lookAt.target = scene.node(target).name;
      return lookAt;
    });
  }
}

}  // namespace check

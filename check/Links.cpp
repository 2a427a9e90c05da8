#include "check/Links.h"

#include "scene/SpecialNames.h"

namespace check {

std::vector<Link> FindLinks(const scene::Scene& scene, const std::vector<Camera>& cameras) {
  std::vector<Link> links;
  std::vector<bool> seen(scene.nodes().size(), false);
  const auto add = [&](scene::NodeId shape, bool camera) {
    bool own = true;
    for (scene::NodeId id = scene.node(shape).parent; id != scene::kNoNode && !seen[id];
         id = scene.node(id).parent) {
      seen[id] = true;
      if (scene.node(id).origin != scene::Origin::Created) break;
      links.push_back({id, shape, own, camera});
      own = false;
    }
  };
  for (const Camera& camera : cameras) {
    if (camera.taken) add(camera.shape, true);
  }
  for (scene::NodeId id = 0; id < scene.nodes().size(); ++id) {
    const scene::Node& node = scene.node(id);
    if (SameName(node.type, "locator") && scene::IsMarked(ImportName(scene, node))) add(id, false);
  }
  return links;
}

}  // namespace check

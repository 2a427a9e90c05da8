#include "check/Links.h"

#include <algorithm>
#include <array>

namespace check {

bool IsMarked(std::string_view name) {
  constexpr std::array<std::string_view, 3> kMarks = {"null", "NULL", "Null"};
  return std::any_of(kMarks.begin(), kMarks.end(),
                     [name](std::string_view mark) { return name.find(mark) != std::string_view::npos; });
}

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
    if (SameName(node.type, "locator") && IsMarked(ImportName(scene, node))) add(id, false);
  }
  return links;
}

}  // namespace check

#include "check/Links.h"

#include <algorithm>

#include "check/LookAts.h"
#include "check/RulesInternal.h"
#include "scene/SpecialNames.h"

namespace check {

std::vector<scene::NodeId> FindMarkedLocators(const scene::Scene& scene) {
  std::vector<scene::NodeId> locators;
  for (scene::NodeId id = 0; id < scene.nodes().size(); ++id) {
    const scene::Node& node = scene.node(id);
    const bool locator = node.origin == scene::Origin::Created && SameName(node.type, "locator");
    if (locator && scene::IsMarked(ImportName(scene, node))) locators.push_back(id);
  }
  return locators;
}

std::vector<Link> FindLinks(const scene::Scene& scene, const std::vector<Camera>& cameras,
                            const std::vector<scene::NodeId>& locators) {
  std::vector<Link> links;
  std::vector<bool> seen(scene.nodes().size(), false);
  const auto add = [&](scene::NodeId shape, bool camera) {
    bool own = true;
    for (scene::NodeId id = scene.node(shape).parent; id != scene::kNoNode && !seen[id];
         id = scene.node(id).parent) {
      seen[id] = true;
      if (scene.node(id).origin != scene::Origin::Created) break;
      links.push_back({.node = id, .shape = shape, .own = own, .ofCamera = camera});
      own = false;
    }
  };
  for (const Camera& camera : cameras) {
    if (camera.taken) add(camera.shape, true);
  }
  for (const scene::NodeId locator : locators) add(locator, false);
  for (const LookAt& lookAt : FindLookAts(scene, cameras)) {
    if (lookAt.target == scene::kNoNode || seen[lookAt.target]) continue;
    seen[lookAt.target] = true;
    links.push_back({.node = lookAt.target, .shape = lookAt.camera->shape, .target = true});
  }
  return links;
}

std::span<const KeyedChannel> KeyedOf(const Subject& subject, const Link& link) {
  const std::span<const KeyedChannel> keyed = subject.channels.KeyedOf(link.node);
  if (!link.target) return keyed;
  const auto end = std::find_if_not(keyed.begin(), keyed.end(), [](const KeyedChannel& one) {
    return one.channel.starts_with("translate");
  });
  return keyed.first(static_cast<std::size_t>(end - keyed.begin()));
}

}  // namespace check

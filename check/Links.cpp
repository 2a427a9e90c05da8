#include "check/Links.h"

#include <algorithm>

#include "check/LookAts.h"
#include "check/RulesInternal.h"
#include "scene/SpecialNames.h"

namespace check {

diag::Range WrittenParent(std::string_view text, const scene::Node& node) {
  constexpr std::size_t kLongestCommand = 4000;
  constexpr std::string_view kOptions[] = {"-p \"", "-parent \""};
  const auto name = static_cast<std::size_t>(node.place.offset);
  const std::size_t earliest = name > kLongestCommand ? name - kLongestCommand : 0;
  const std::size_t begin = text.substr(earliest, name - earliest).rfind("createNode");
  if (begin == std::string_view::npos) return {};
  const std::string_view rest = text.substr(earliest + begin, 2 * kLongestCommand);
  const std::string_view command = rest.substr(0, std::min(rest.find(';'), rest.size()));
  for (const std::string_view option : kOptions) {
    const std::size_t at = command.find(option);
    if (at == std::string_view::npos) continue;
    const std::size_t start = at + option.size();
    const std::size_t end = std::min(command.find('"', start), command.size());
    return {earliest + begin + start, end - start};
  }
  return {};
}

bool IsFosterParent(const scene::Node& node) { return node.type == "fosterParent"; }

ParentLoss ParentLossOf(const scene::Scene& scene, const scene::Node& node) {
  if (node.parent == scene::kNoNode) return ParentLoss::None;
  const diag::Range written = WrittenParent(scene.text(), node);
  const auto begin = scene.text().begin() + static_cast<std::ptrdiff_t>(written.offset);
  const bool path = std::find(begin, begin + static_cast<std::ptrdiff_t>(written.length), '|') !=
                    begin + static_cast<std::ptrdiff_t>(written.length);
  if (path) return ParentLoss::Path;
  const scene::Node& parent = scene.node(node.parent);
  if (parent.origin != scene::Origin::Created || IsFosterParent(parent)) return ParentLoss::Elsewhere;
  return IsImportedTransform(parent.type) ? ParentLoss::None : ParentLoss::NotImported;
}

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
    for (scene::NodeId id = shape; ParentLossOf(scene, scene.node(id)) == ParentLoss::None;) {
      const bool own = id == shape;
      id = scene.node(id).parent;
      if (id == scene::kNoNode || seen[id]) break;
      seen[id] = true;
      links.push_back({.node = id, .shape = shape, .own = own, .ofCamera = camera});
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

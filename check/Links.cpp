#include "check/Links.h"

#include <algorithm>

#include "check/LookAts.h"
#include "check/RulesInternal.h"
#include "check/Tokens.h"
#include "scene/SpecialNames.h"

namespace check {

// Reads the command again. It tries the nearest words "createNode" before the node, because one can stand in
// a string.
diag::Range WrittenParent(std::string_view text, const scene::Node& node) {
  constexpr std::string_view kWord = "createNode";
  constexpr std::size_t kLongestHead = 65'536;
  constexpr std::size_t kMostTries = 8;
  const auto place = static_cast<std::size_t>(node.place.offset);
  const std::size_t earliest = place > kLongestHead ? place - kLongestHead : 0;
  std::string_view before = text.substr(earliest, place - earliest);
  for (std::size_t tries = 0; tries < kMostTries; ++tries) {
    const std::size_t begin = before.rfind(kWord);
    if (begin == std::string_view::npos) return {};
    scene::Cursor cursor(text);
    cursor.MoveTo(static_cast<std::uint32_t>(earliest + begin + kWord.size()));
    diag::Range parent{};
    std::string_view token;
    bool quoted = false;
    bool follows = false;  // an option of a parent came before
    bool found = false;
    while (TakeToken(&cursor, &token, &quoted)) {
      const auto offset = static_cast<std::size_t>(token.data() - text.data());
      if (follows) parent = {offset, token.size()};
      found = found || offset == place;
      follows = !quoted && (token == "-p" || token == "-parent");
    }
    if (found) return parent;
    before = before.substr(0, begin);
  }
  return {};
}

bool IsFosterParent(const scene::Node& node) { return node.type == "fosterParent"; }

namespace {

std::string_view TextOf(const scene::Scene& scene, const diag::Range& range) {
  return scene.text().substr(static_cast<std::size_t>(range.offset), static_cast<std::size_t>(range.length));
}

// Whether a node that stands at the top was created under another one.
bool WasMovedOut(const scene::Scene& scene, const scene::Node& node) {
  if (node.origin != scene::Origin::Created || node.shared) return false;
  const std::string_view written = TextOf(scene, WrittenParent(scene.text(), node));
  if (written.empty()) return false;
  const scene::NodeId parent = scene.Find(written);
  // Of parents in a circle one is cut off.
  for (scene::NodeId id = parent; id != scene::kNoNode; id = scene.node(id).parent) {
    if (&scene.node(id) == &node) return false;
  }
  return parent != scene::kNoNode;
}

}  // namespace

ParentLoss ParentLossOf(const scene::Scene& scene, const scene::Node& node) {
  if (node.parent == scene::kNoNode) return WasMovedOut(scene, node) ? ParentLoss::Command : ParentLoss::None;
  const diag::Range written = WrittenParent(scene.text(), node);
  if (TextOf(scene, written).find('|') != std::string_view::npos) return ParentLoss::Path;
  const scene::Node& parent = scene.node(node.parent);
  if (parent.origin != scene::Origin::Created || IsFosterParent(parent)) return ParentLoss::Elsewhere;
  if (!IsImportedTransform(parent.type)) return ParentLoss::NotImported;
  const std::string_view name = ImportName(scene, parent);
  const bool asWritten = name.empty() || TextOf(scene, written) == name;
  return asWritten ? ParentLoss::None : ParentLoss::Command;
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

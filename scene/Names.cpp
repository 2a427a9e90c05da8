#include "scene/Names.h"

#include <cstddef>

namespace scene {
namespace {

// A name within a path: without the ":" of the topmost namespace, and without the "->" that leads from a
// camera to its image plane.
std::string_view Bare(std::string_view name) {
  if (!name.empty() && name[0] == ':') name.remove_prefix(1);
  if (name.size() > 2 && name.substr(name.size() - 2) == "->") name.remove_suffix(2);
  return name;
}

// Removes the first name of a path with the "|" after it, and returns it.
std::string_view TakeName(std::string_view* path) {
  const std::size_t bar = path->find('|');
  const std::string_view name = path->substr(0, bar);
  path->remove_prefix(bar == std::string_view::npos ? path->size() : bar + 1);
  return Bare(name);
}

// Removes the last name of a path with the "|" before it, and returns it.
std::string_view TakeLastName(std::string_view* path) {
  const std::size_t bar = path->rfind('|');
  const std::string_view name = bar == std::string_view::npos ? *path : path->substr(bar + 1);
  *path = path->substr(0, bar == std::string_view::npos ? 0 : bar);
  return Bare(name);
}

}  // namespace

void Names::Add(NodeId node, NodeId parent, std::string_view name) {
  if (entries_.size() <= node) entries_.resize(static_cast<std::size_t>(node) + 1);
  Namesakes& namesakes = byName_.At(0, name);
  entries_[node] = {name, parent, namesakes.last, kNoNode};
  (namesakes.last == kNoNode ? namesakes.first : entries_[namesakes.last].after) = node;
  namesakes.last = node;
  ++namesakes.count;
  AddInstance(node, parent, name);
}

void Names::AddInstance(NodeId node, NodeId parent, std::string_view name) {
  Child& child = byPlace_.At(parent, name);
  if (child.node == kNoNode) child.node = node;
}

void Names::Remove(NodeId node, NodeId parent, std::string_view name) {
  Namesakes& namesakes = byName_.At(0, name);
  const Entry& entry = entries_[node];
  (entry.before == kNoNode ? namesakes.first : entries_[entry.before].after) = entry.after;
  (entry.after == kNoNode ? namesakes.last : entries_[entry.after].before) = entry.before;
  --namesakes.count;
  Child& child = byPlace_.At(parent, name);
  if (child.node == node) child.node = kNoNode;
}

NodeId Names::ChildOf(NodeId parent, std::string_view name) const {
  const Child* const child = byPlace_.Find(parent, name);
  return child == nullptr ? kNoNode : child->node;
}

// The node that the path leads to from another; kNoNode where it leads nowhere.
NodeId Names::Below(NodeId node, std::string_view path) const {
  while (!path.empty()) {
    node = ChildOf(node, TakeName(&path));
    if (node == kNoNode) return kNoNode;
  }
  return node;
}

// Whether the node was added with such a path at its end.
bool Names::IsAt(NodeId node, std::string_view path) const {
  while (node != kNoNode && node < entries_.size() && entries_[node].name == TakeLastName(&path)) {
    if (path.empty()) return true;
    node = entries_[node].parent;
  }
  return false;
}

// The first of the nodes for which `fits` names a node, and whether it names a second one.
template <typename Fits>
Names::Match Names::FindAmong(const Namesakes* namesakes, Fits fits) const {
  Match match;
  NodeId candidate = namesakes == nullptr ? kNoNode : namesakes->first;
  for (std::uint32_t looked = 0; candidate != kNoNode && looked < kMostCandidates; ++looked) {
    const NodeId found = fits(candidate);
    if (found != kNoNode && match.node != kNoNode) return {match.node, true};
    if (found != kNoNode) match.node = found;
    candidate = entries_[candidate].after;
  }
  return match;
}

Names::Match Names::Find(std::string_view nameOrPath) const {
  if (!nameOrPath.empty() && nameOrPath[0] == '|') {
    return {nameOrPath.size() == 1 ? kNoNode : Below(kNoNode, nameOrPath.substr(1)), false};
  }
  const Part part = RarestPart(nameOrPath);
  if (part.namesakes == nullptr) return {};
  if (nameOrPath.find('|') == std::string_view::npos) {
    return {part.namesakes->first, part.namesakes->count > 1};
  }
  const Match match = FindAmong(part.namesakes, [&](NodeId candidate) {
    return IsAt(candidate, part.above) ? Below(candidate, part.below) : kNoNode;
  });
  if (match.node != kNoNode) return match;
  // A node may be in a second place too, which is found only from the parent down.
  std::string_view below = nameOrPath;
  const Namesakes* const first = byName_.Find(0, TakeName(&below));
  return FindAmong(first, [&](NodeId candidate) { return Below(candidate, below); });
}

// The name of a path that the fewest nodes have, with what stands before and after it.
Names::Part Names::RarestPart(std::string_view path) const {
  Part rarest;
  for (std::string_view below = path; !below.empty();) {
    const Namesakes* const namesakes = byName_.Find(0, TakeName(&below));
    if (namesakes == nullptr || namesakes->count == 0) return {};
    if (rarest.namesakes != nullptr && rarest.namesakes->count <= namesakes->count) continue;
    const std::size_t end = path.size() - below.size() - (below.empty() ? 0 : 1);
    rarest = {namesakes, path.substr(0, end), below};
  }
  return rarest;
}

}  // namespace scene

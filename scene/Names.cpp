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

// The first name of a path, which is taken off with the "|" after it.
std::string_view TakeName(std::string_view* path) {
  const std::size_t bar = path->find('|');
  const std::string_view name = path->substr(0, bar);
  path->remove_prefix(bar == std::string_view::npos ? path->size() : bar + 1);
  return Bare(name);
}

}  // namespace

void Names::Add(NodeId node, NodeId parent, std::string_view name) {
  if (links_.size() <= node) links_.resize(static_cast<std::size_t>(node) + 1);
  Namesakes& namesakes = byName_.At(0, name);
  links_[node] = {namesakes.last, kNoNode};
  if (namesakes.last == kNoNode) {
    namesakes.first = node;
  } else {
    links_[namesakes.last].after = node;
  }
  namesakes.last = node;
  AddInstance(node, parent, name);
}

void Names::AddInstance(NodeId node, NodeId parent, std::string_view name) {
  Child& child = byPlace_.At(parent, name);
  if (child.node == kNoNode) child.node = node;
}

void Names::Remove(NodeId node, NodeId parent, std::string_view name) {
  Namesakes& namesakes = byName_.At(0, name);
  const Links links = links_[node];
  (links.before == kNoNode ? namesakes.first : links_[links.before].after) = links.after;
  (links.after == kNoNode ? namesakes.last : links_[links.after].before) = links.before;
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

Names::Match Names::Find(std::string_view nameOrPath) const {
  if (!nameOrPath.empty() && nameOrPath[0] == '|') {
    return {nameOrPath.size() == 1 ? kNoNode : Below(kNoNode, nameOrPath.substr(1)), false};
  }
  const Namesakes* const namesakes = byName_.Find(0, TakeName(&nameOrPath));
  Match match;
  if (namesakes == nullptr) return match;
  NodeId candidate = namesakes->first;
  for (int looked = 0; candidate != kNoNode && looked < kMostCandidates; ++looked) {
    const NodeId found = Below(candidate, nameOrPath);
    if (found != kNoNode && match.node != kNoNode) {
      match.several = true;
      return match;
    }
    if (found != kNoNode) match.node = found;
    candidate = links_[candidate].after;
  }
  return match;
}

}  // namespace scene

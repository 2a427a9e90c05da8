// Nodes and their names.
#include <cstddef>
#include <utility>

#include "scene/ByteClasses.h"
#include "scene/SceneBuilder.h"

namespace scene {
namespace {

// How many digits at the end of a name count as its number.
constexpr std::size_t kMostDigits = 8;

std::string_view WithoutTopmost(std::string_view name) {
  if (!name.empty() && name[0] == ':') name.remove_prefix(1);
  return name;
}

// The name without the number at its end.
std::string_view Stem(std::string_view name) {
  std::size_t digits = 0;
  while (digits < kMostDigits && digits + 1 < name.size() &&
         IsByte(name[name.size() - 1 - digits], kDigitByte)) {
    ++digits;
  }
  return name.substr(0, name.size() - digits);
}

}  // namespace

SceneBuilder::SceneBuilder(std::string_view text, diag::Collector* diagnostics, std::vector<NodeNote>* notes)
    : diagnostics_(diagnostics), notes_(notes) {
  scene_.text_ = text;
}

std::string_view SceneBuilder::Keep(std::string text) { return scene_.made_.emplace_back(std::move(text)); }

NodeId SceneBuilder::AddNode(const Node& node) {
  const auto id = static_cast<NodeId>(scene_.nodes_.size());
  scene_.nodes_.push_back(node);
  scene_.types_.push_back(TypeNumberOf(node.type));
  return id;
}

// The node's own name: the last name of a path, in the current namespace.
std::string_view SceneBuilder::OwnName(Named name) {
  std::string_view own = name.text;
  if (const std::size_t bar = own.rfind('|'); bar != std::string_view::npos) own = own.substr(bar + 1);
  const bool topmost = !own.empty() && own[0] == ':';
  own = WithoutTopmost(own);
  if (topmost || nameSpace_.empty() || own.empty()) return own;
  return Keep(std::string(nameSpace_) + ':' + std::string(own));
}

// The name, or the first one with another number that is free under the parent.
std::string_view SceneBuilder::FreeName(NodeId parent, std::string_view name) {
  if (scene_.names_.ChildOf(parent, name) == kNoNode) return name;
  const std::string_view stem = Stem(name);
  Counter& counter = counters_.At(parent, stem);
  std::string free;
  do {
    free = std::string(stem) + std::to_string(++counter.next);
  } while (scene_.names_.ChildOf(parent, free) != kNoNode);
  return Keep(std::move(free));
}

NodeId SceneBuilder::CreateNode(Named type, Named name, Named parent, bool shared) {
  const NodeId above = parent.text.empty() ? kNoNode : Resolve(parent);
  std::string_view own = OwnName(name);
  const bool unnamed = own.empty();
  if (unnamed) own = Keep(std::string(type.text) + '1');
  if (shared) {
    const NodeId there = scene_.names_.ChildOf(above, own);
    if (there != kNoNode && scene_.nodes_[there].type == type.text) return there;
  }
  const std::string_view free = FreeName(above, own);
  const diag::Range place = unnamed ? type.place : name.place;
  if (free != own && !unnamed) diagnostics_->Report(diag::Code::NameTaken, place, {own, free});
  const NodeId id =
      AddNode({.type = type.text, .name = free, .parent = above, .place = place, .shared = shared});
  scene_.names_.Add(id, above, free);
  return id;
}

NodeId SceneBuilder::Resolve(Named name) {
  if (!nameSpace_.empty() && !name.text.empty() && name.text[0] != ':' && name.text[0] != '|') {
    const std::string inside = std::string(nameSpace_) + ':' + std::string(name.text);
    if (const NodeId found = scene_.names_.Find(inside).node; found != kNoNode) return found;
  }
  const Names::Match match = scene_.names_.Find(name.text);
  if (match.several) diagnostics_->Report(diag::Code::AmbiguousName, name.place, {name.text});
  return match.node != kNoNode ? match.node : NodeFromElsewhere(name);
}

NodeId SceneBuilder::NodeFromElsewhere(Named name) {
  Scene::IndexOfOne& known = fromElsewhere_.At(0, name.text);
  if (known.plusOne != 0) return known.plusOne - 1;
  // A name in the topmost namespace is that of a node that every scene has. Others are looked up again at the
  // end.
  const bool program =
      !name.text.empty() && name.text[0] == ':' && name.text.find('|') == std::string_view::npos;
  const std::string_view own = WithoutTopmost(name.text);
  const NodeId id = AddNode({.type = TypeOfProgramNode(own),
                             .name = own,
                             .place = name.place,
                             .origin = program ? Origin::Program : Origin::Elsewhere});
  known.plusOne = id + 1;
  if (program) scene_.names_.Add(id, kNoNode, own);
  return id;
}

NodeId SceneBuilder::FindCreated(Named name, std::string_view command) {
  const Names::Match match = scene_.names_.Find(name.text);
  if (match.several) diagnostics_->Report(diag::Code::AmbiguousName, name.place, {name.text});
  if (match.node == kNoNode) diagnostics_->Report(diag::Code::UnknownNode, name.place, {command, name.text});
  return match.node;
}

// Whether the node is from elsewhere and cannot be changed. Reports it then.
bool SceneBuilder::IsElsewhere(NodeId id, diag::Range place, std::string_view command) {
  if (scene_.nodes_[id].origin != Origin::Elsewhere) return false;
  diagnostics_->Report(diag::Code::UnknownNode, place, {command, scene_.nodes_[id].name});
  return true;
}

void SceneBuilder::Rename(NodeId id, Named name) {
  Node& node = scene_.nodes_[id];
  if (IsElsewhere(id, name.place, "rename")) return;
  const std::string_view own = OwnName(name);
  if (own.empty() || own == node.name) return;
  scene_.names_.Remove(id, node.parent, node.name);
  const std::string_view free = FreeName(node.parent, own);
  if (free != own) diagnostics_->Report(diag::Code::NameTaken, name.place, {own, free});
  node.name = free;
  scene_.names_.Add(id, node.parent, free);
}

void SceneBuilder::MoveUnder(NodeId id, NodeId parent, diag::Range place) {
  Node& node = scene_.nodes_[id];
  if (IsElsewhere(id, place, "parent")) return;
  if (node.parent == parent) return;
  scene_.names_.Remove(id, node.parent, node.name);
  const std::string_view free = FreeName(parent, node.name);
  if (free != node.name) diagnostics_->Report(diag::Code::NameTaken, node.place, {node.name, free});
  node.parent = parent;
  node.name = free;
  scene_.names_.Add(id, parent, free);
}

void SceneBuilder::AddInstance(NodeId node, NodeId parent) {
  scene_.names_.AddInstance(node, parent, scene_.nodes_[node].name);
}

void SceneBuilder::SetNameSpace(std::string_view nameSpace) { nameSpace_ = WithoutTopmost(nameSpace); }

}  // namespace scene

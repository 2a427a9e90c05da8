// The end of a scene: finds nodes that were named before they were created, cuts circles of parents, and
// links the lists. Each step is one pass.
#include <cstddef>
#include <string>
#include <utility>

#include "scene/SceneBuilder.h"

namespace scene {

Scene SceneBuilder::Finish() {
  ReplaceForward(FindForward());
  CutCircles();
  scene_.lists_.assign(scene_.nodes_.size(), {});
  LinkChildren();
  LinkSettings();
  LinkConnections();
  ReportReferences();
  ReportParents();
  return std::move(scene_);
}

// For each node the node that replaces it: itself, unless it stands for a name that was used before its node
// was created.
std::vector<NodeId> SceneBuilder::FindForward() {
  std::vector<NodeId> replacement(scene_.nodes_.size());
  for (NodeId id = 0; id < replacement.size(); ++id) {
    replacement[id] = id;
    Node& node = scene_.nodes_[id];
    if (node.origin != Origin::Elsewhere) continue;
    const Names::Match match = scene_.names_.Find(node.name);
    if (match.several) diagnostics_->Report(diag::Code::AmbiguousName, node.place, {node.name});
    if (match.node != kNoNode) {
      replacement[id] = match.node;
      node.origin = Origin::Forward;
    } else if (node.name.find('|') == std::string_view::npos) {
      scene_.names_.Add(id, kNoNode, node.name);
    }
  }
  return replacement;
}

void SceneBuilder::ReplaceForward(const std::vector<NodeId>& replacement) {
  if (notes_ != nullptr) {
    for (NodeNote& note : *notes_) note.node = replacement[note.node];
  }
  for (NodeId id = 0; id < replacement.size(); ++id) {
    Node& node = scene_.nodes_[id];
    if (node.parent == kNoNode || replacement[node.parent] == node.parent) continue;
    node.parent = replacement[node.parent];
    scene_.names_.AddInstance(id, node.parent, node.name);
  }
  for (Setting& setting : scene_.settings_) {
    if (replacement[setting.node] == setting.node) continue;
    // The created node may have a long name for the attribute.
    setting.node = replacement[setting.node];
    setting.attribute = scene_.PlugOf(setting.node, setting.attribute, setting.first).attribute;
  }
  for (std::uint32_t at = 0; at < scene_.connections_.size(); ++at) {
    Connection& connection = scene_.connections_[at];
    for (Plug* plug : {&connection.source, &connection.destination}) {
      const NodeId node = replacement[plug->node];
      if (node == plug->node) continue;
      *plug = scene_.PlugOf(node, plug->attribute, plug->index);
      if (plug == &connection.destination && !scene_.connectionLinks_[at].cut) Index(at);
    }
  }
}

// A node that is its own ancestor loses its parent. Every node is visited once.
void SceneBuilder::CutCircles() {
  enum class State : std::uint8_t { New, OnTheWay, Done };
  std::vector<State> states(scene_.nodes_.size(), State::New);
  std::vector<NodeId> way;
  for (NodeId start = 0; start < states.size(); ++start) {
    NodeId at = start;
    for (; at != kNoNode && states[at] == State::New; at = scene_.nodes_[at].parent) {
      states[at] = State::OnTheWay;
      way.push_back(at);
    }
    if (at != kNoNode && states[at] == State::OnTheWay) {
      Node& node = scene_.nodes_[at];
      diagnostics_->Report(diag::Code::ParentCircle, node.place, {node.name});
      node.parent = kNoNode;
      scene_.names_.AddInstance(at, kNoNode, node.name);
    }
    for (const NodeId passed : way) states[passed] = State::Done;
    way.clear();
  }
}

void SceneBuilder::LinkChildren() {
  std::vector<NodeId> lastChild(scene_.nodes_.size(), kNoNode);
  for (NodeId id = 0; id < scene_.nodes_.size(); ++id) {
    const NodeId parent = scene_.nodes_[id].parent;
    if (parent == kNoNode) continue;
    NodeId& last = lastChild[parent];
    (last == kNoNode ? scene_.nodes_[parent].firstChild : scene_.nodes_[last].nextSibling) = id;
    last = id;
  }
}

void SceneBuilder::LinkSettings() {
  for (std::uint32_t at = 0; at < scene_.settings_.size(); ++at) {
    Scene::Lists& lists = scene_.lists_[scene_.settings_[at].node];
    (lists.lastSetting == Scene::kNone ? lists.firstSetting : scene_.settings_[lists.lastSetting].next) = at;
    lists.lastSetting = at;
  }
  scene_.settingIndex_ = SettingIndex(scene_.settings_, scene_.nodes_.size());
}

void SceneBuilder::LinkConnections() {
  for (std::uint32_t at = 0; at < scene_.connections_.size(); ++at) {
    if (scene_.connectionLinks_[at].cut) continue;
    const Connection& connection = scene_.connections_[at];
    Scene::Lists& into = scene_.lists_[connection.destination.node];
    (into.lastInto == Scene::kNone ? into.firstInto : scene_.connectionLinks_[into.lastInto].nextInto) = at;
    into.lastInto = at;
    Scene::Lists& from = scene_.lists_[connection.source.node];
    (from.lastFrom == Scene::kNone ? from.firstFrom : scene_.connectionLinks_[from.lastFrom].nextFrom) = at;
    from.lastFrom = at;
    const bool foster = scene_.nodes_[connection.source.node].type == "fosterParent";
    if (!foster || connection.destination.attribute != "fosterParent") continue;
    referenceOfFoster_.At(connection.source.node, {}).plusOne = connection.destination.node + 1;
  }
}

// The file of the reference in which the node stands; empty where none is known.
std::string_view SceneBuilder::ReferencedFileOf(NodeId parent) const {
  const Node& node = scene_.nodes_[parent];
  const Scene::IndexOfOne* found = nullptr;
  if (node.type == "fosterParent") {
    // Its last connection names the reference; where there is none, its own name does.
    const Scene::IndexOfOne* const connected = referenceOfFoster_.Find(parent, {});
    found = referenceByName_.Find(0, connected == nullptr ? node.name.substr(0, node.name.rfind(node.type))
                                                          : scene_.nodes_[connected->plusOne - 1].name);
  } else {
    const std::size_t bar = node.name.rfind('|');
    const std::string_view own = bar == std::string_view::npos ? node.name : node.name.substr(bar + 1);
    // "a:b:name" is in the space "a:b", or "b" is a space within the file of "a".
    for (const std::size_t colon : {own.rfind(':'), own.find(':')}) {
      if (found != nullptr || colon == std::string_view::npos) continue;
      found = referenceBySpace_.Find(0, own.substr(0, colon));
    }
  }
  if (found == nullptr || found->plusOne == 0) return {};
  return scene_.references_[found->plusOne - 1].file;
}

void SceneBuilder::ReportReferences() {
  if (referencesRead_ == 0) return;
  diagnostics_->Report(diag::Code::ReferenceNotRead, firstRead_.place,
                       {std::to_string(referencesRead_), firstRead_.file});
}

void SceneBuilder::ReportParents() {
  for (const Node& node : scene_.nodes_) {
    if (node.parent == kNoNode || node.origin != Origin::Created) continue;
    const Node& parent = scene_.nodes_[node.parent];
    const bool foster = parent.type == "fosterParent";
    if (!foster && parent.origin == Origin::Created) continue;
    const std::string_view file = ReferencedFileOf(node.parent);
    if (foster || !file.empty()) {
      const auto id = static_cast<NodeId>(&node - scene_.nodes_.data());
      Note({diag::Code::ParentInReference, id, node.place, {parent.name, node.name, file}});
    } else {
      diagnostics_->Report(diag::Code::ParentMissing, node.place, {parent.name, node.name});
    }
  }
}

}  // namespace scene

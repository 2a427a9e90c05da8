// Channels of one node with different numbers of keys: what stops an import after it has begun to build.
#include <string>
#include <string_view>
#include <vector>

#include "check/Curves.h"
#include "check/RulesInternal.h"
#include "scene/Attributes.h"

namespace check {
namespace {

using scene::NodeId;

struct Counted {
  NodeId node = scene::kNoNode;
  std::string_view channel;
  NodeId curve = scene::kNoNode;
  std::size_t keys = 0;
  diag::Range place{};  // of the first keys
};

std::vector<Counted> CountKeys(const Subject& subject, NodeId node) {
  std::vector<Counted> counted;
  for (const KeyedChannel& channel : subject.channels.KeyedOf(node))
    counted.push_back({node, channel.channel, channel.curve, channel.keys, channel.place});
  return counted;
}

// "3 on rotateY (\"turnY\")"
std::string KeysOn(const Subject& subject, const Counted& one) {
  return std::to_string(one.keys) + " on " + std::string(one.channel) + " (\"" +
         std::string(subject.scene.node(one.curve).name) + "\")";
}

// Reports the curves whose number of keys is another than the first one's, at the first of them. False where
// there is none.
bool ReportUnequal(const Subject& subject, const std::vector<Counted>& counted) {
  const Counted* first = nullptr;
  const Counted* odd = nullptr;
  std::string others;
  for (const Counted& one : counted) {
    if (one.keys < 2) continue;
    if (first == nullptr) first = &one;
    if (one.keys == first->keys) continue;
    if (odd == nullptr) odd = &one;
    others += (others.empty() ? "" : ", ") + KeysOn(subject, one);
  }
  if (odd == nullptr) return false;
  subject.diagnostics.Report(diag::Code::UnequalKeys, odd->place,
                             {subject.scene.node(odd->node).name, std::to_string(first->keys),
                              std::string(first->channel), subject.scene.node(first->curve).name, others});
  return true;
}

std::vector<NodeId> NamedLike(const Subject& subject, NodeId node) {
  const std::string_view name = ImportName(subject.scene, subject.scene.node(node));
  std::vector<NodeId> nodes;
  for (NodeId id = 0; id < subject.scene.nodes().size(); ++id) {
    if (SameName(ImportName(subject.scene, subject.scene.node(id)), name)) nodes.push_back(id);
  }
  return nodes;
}

// The import looks for names: the curves of all nodes of one name are one node's, and any of several curves
// of one name can be meant.
std::vector<Counted> CountKeysByName(const Subject& subject, NodeId node) {
  std::vector<Counted> counted;
  for (const NodeId twin : NamedLike(subject, node)) {
    for (const Counted& one : CountKeys(subject, twin)) {
      for (const NodeId curve : NamedLike(subject, one.curve)) {
        Counted other{one.node, one.channel, curve};
        for (const scene::Piece& piece : subject.scene.Pieces(curve, "keyTimeValue")) {
          if (other.keys == 0) other.place = piece.value.range();
          other.keys += piece.value.Numbers().size() / 2;
        }
        counted.push_back(other);
      }
    }
  }
  return counted;
}

// The import stopped at the last layer that it made, or at what this layer is aimed at.
NodeId LastNode(const Subject& subject) {
  if (subject.cameOver.layers.empty()) return scene::kNoNode;
  const CameOverLayer& last = subject.cameOver.layers.back();
  for (const Camera& camera : subject.cameras) {
    if (camera.layer == &last) return camera.transform;
  }
  for (NodeId id = 0; id < subject.scene.nodes().size(); ++id) {
    const scene::Node& node = subject.scene.node(id);
    if (!SameName(ImportName(subject.scene, node), last.name)) continue;
    return SameName(node.type, "locator") ? node.parent : id;
  }
  return scene::kNoNode;
}

}  // namespace

void ReportKeyCounts(const Subject& subject) {
  const NodeId last = LastNode(subject);
  if (last != scene::kNoNode) {
    if (ReportUnequal(subject, CountKeys(subject, last))) return;
    if (ReportUnequal(subject, CountKeysByName(subject, last))) return;
  }
  for (NodeId id = 0; id < subject.scene.nodes().size(); ++id) {
    if (ReportUnequal(subject, CountKeys(subject, id))) return;
  }
  ReportOtherStop(subject.scene.text(), subject.cameOver, &subject.diagnostics);
}

}  // namespace check

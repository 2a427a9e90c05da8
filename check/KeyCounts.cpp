// Channels of one node with different numbers of keys: what stops an import after it has begun to build.
#include <algorithm>
#include <string>

#include "check/Curves.h"
#include "check/RulesInternal.h"
#include "scene/Attributes.h"

namespace check {
namespace {

using scene::NodeId;

// Reports each curve whose number of keys is another than the first one's. False where there is none.
bool ReportUnequal(const Subject& subject, NodeId node) {
  const KeyedChannel* first = nullptr;
  bool reported = false;
  for (const KeyedChannel& channel : subject.channels.KeyedOf(node)) {
    if (channel.keys < 2) continue;
    if (first == nullptr) first = &channel;
    if (channel.keys == first->keys) continue;
    reported = true;
    subject.diagnostics.Report(diag::Code::UnequalKeys, channel.place,
                               {subject.scene.node(node).name, std::to_string(first->keys), first->channel,
                                subject.scene.node(first->curve).name, std::to_string(channel.keys),
                                channel.channel, subject.scene.node(channel.curve).name});
  }
  return reported;
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
  if (last != scene::kNoNode && ReportUnequal(subject, last)) return;
  for (NodeId id = 0; id < subject.scene.nodes().size(); ++id) {
    if (ReportUnequal(subject, id)) return;
  }
  ReportOtherStop(subject.scene.text(), subject.cameOver, &subject.diagnostics);
}

}  // namespace check

// What the layers of the import depend on: the nodes of which a note is worth its line.
#include <vector>

#include "check/RulesInternal.h"

namespace check {
namespace {

using scene::NodeId;

// By node: whether a camera or a null comes from it. Upwards, and against the connections.
std::vector<bool> FindDependencies(const Subject& subject) {
  std::vector<bool> found(subject.scene.nodes().size(), false);
  std::vector<NodeId> pending;
  const auto add = [&](NodeId node) {
    if (node == scene::kNoNode || found[node]) return;
    found[node] = true;
    pending.push_back(node);
  };
  for (const Camera& camera : subject.cameras) {
    if (camera.taken) add(camera.shape);
  }
  for (const Link& link : subject.links) {
    add(link.node);
    add(link.shape);
  }
  while (!pending.empty()) {
    const NodeId node = pending.back();
    pending.pop_back();
    add(subject.scene.node(node).parent);
    for (const scene::Connection* const connection : subject.scene.ConnectionsInto(node))
      add(connection->source.node);
  }
  return found;
}

}  // namespace

void ReportNodeNotes(const Subject& subject, std::span<const scene::NodeNote> notes) {
  if (notes.empty()) return;
  const std::vector<bool> counts = FindDependencies(subject);
  for (const scene::NodeNote& note : notes) {
    if (counts[note.node]) scene::Report(note, &subject.diagnostics);
  }
}

}  // namespace check

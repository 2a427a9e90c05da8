// Look-ats of cameras that the importer does not recognise, or takes for something else.
#include <algorithm>
#include <string_view>
#include <vector>

#include "check/LookAts.h"
#include "check/RulesInternal.h"

namespace check {
namespace {

using diag::Code;
using scene::NodeId;

// The last connection into the look-at that the importer takes for its target; null where there is none.
const scene::Connection* LastTarget(const scene::Scene& scene, NodeId lookAt) {
  const std::vector<const scene::Connection*> targets = TargetsOf(scene, lookAt);
  return targets.empty() ? nullptr : targets.back();
}

void ReportLookAt(const Subject& subject, NodeId lookAt, const Camera& camera) {
  const scene::Scene& scene = subject.scene;
  const scene::Node& node = scene.node(lookAt);
  const std::string_view shown = scene.node(camera.shape).name;
  const scene::Connection* const target = LastTarget(scene, lookAt);
  if (camera.layer != nullptr && camera.layer->aimed) {
    if (target != nullptr && target->source.node == lookAt) {
      subject.diagnostics.Report(Code::LookAtWeightLast, target->destinationPlace, {node.name, shown});
    }
    return;
  }
  if (target == nullptr)
    return subject.diagnostics.Report(Code::LookAtShortNames, node.place, {node.name, shown});
  subject.diagnostics.Report(Code::LookAtNotTaken, node.place, {node.name, shown});
}

// The look-ats that turn the transform, each once.
std::vector<NodeId> LookAtsOf(const scene::Scene& scene, NodeId transform) {
  std::vector<NodeId> found;
  for (const scene::Connection* const connection : scene.ConnectionsInto(transform)) {
    const NodeId source = connection->source.node;
    const std::string_view type = scene.node(source).type;
    const bool turns = connection->destination.attribute.starts_with("rotate");
    if (turns && IsLookAt(type) && std::find(found.begin(), found.end(), source) == found.end())
      found.push_back(source);
  }
  return found;
}

}  // namespace

void ReportLostLookAts(const Subject& subject) {
  for (const Camera& camera : subject.cameras) {
    const bool comes = camera.layer != nullptr || (camera.taken && subject.cameOver.stop != Stop::None);
    if (!comes || camera.transform == scene::kNoNode) continue;
    for (const NodeId lookAt : LookAtsOf(subject.scene, camera.transform))
      ReportLookAt(subject, lookAt, camera);
  }
}

}  // namespace check

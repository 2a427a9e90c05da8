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

// The camera does not turn as the look-at has it. That a bake finds no answer for the look-at either is then
// no news.
void Say(const Subject& subject, Code code, const diag::Range& place, NodeId lookAt, const Camera& camera) {
  const scene::Scene& scene = subject.scene;
  subject.diagnostics.Report(code, place, {scene.node(lookAt).name, scene.node(camera.shape).name});
  if (subject.driversSaid == nullptr) return;
  for (const scene::Connection* const connection : scene.ConnectionsInto(camera.transform)) {
    if (connection->source.node == lookAt) subject.driversSaid->insert(connection->destinationPlace.offset);
  }
}

void ReportLookAt(const Subject& subject, NodeId lookAt, const Camera& camera) {
  const scene::Connection* const target = LastTarget(subject.scene, lookAt);
  if (camera.layer != nullptr && camera.layer->aimed) {
    if (target != nullptr && target->source.node == lookAt)
      Say(subject, Code::LookAtWeightLast, target->destinationPlace, lookAt, camera);
    return;
  }
  const Code code = target == nullptr ? Code::LookAtShortNames : Code::LookAtNotTaken;
  Say(subject, code, subject.scene.node(lookAt).place, lookAt, camera);
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

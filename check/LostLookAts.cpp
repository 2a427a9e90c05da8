// Look-ats of cameras that the importer does not recognise, or takes for something else.
#include <algorithm>
#include <string_view>
#include <vector>

#include "check/RulesInternal.h"

namespace check {
namespace {

using diag::Code;
using scene::NodeId;

constexpr std::string_view kTarget = "target";

// The attribute of a plug as the file has it.
std::string_view WrittenAttribute(const scene::Scene& scene, const diag::Range& plug) {
  const std::string_view text =
      scene.text().substr(static_cast<std::size_t>(plug.offset), static_cast<std::size_t>(plug.length));
  const std::size_t dot = text.find('.');
  return dot == std::string_view::npos ? std::string_view() : text.substr(dot + 1);
}

// The last connection into the look-at that the importer takes for its target; null where there is none.
const scene::Connection* LastTarget(const scene::Scene& scene, NodeId lookAt) {
  const scene::Connection* last = nullptr;
  for (const scene::Connection* const connection : scene.ConnectionsInto(lookAt)) {
    const std::string_view attribute = WrittenAttribute(scene, connection->destinationPlace);
    if (attribute.find(kTarget) == std::string_view::npos) continue;
    if (last == nullptr || last->destinationPlace.offset < connection->destinationPlace.offset)
      last = connection;
  }
  return last;
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
    const bool lookAt = SameName(type, "lookAt") || SameName(type, "aimConstraint");
    if (turns && lookAt && std::find(found.begin(), found.end(), source) == found.end())
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

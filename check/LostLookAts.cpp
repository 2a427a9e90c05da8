// Look-ats of cameras that the importer does not recognise, or takes for something else.
#include <algorithm>
#include <cmath>
#include <string_view>
#include <unordered_map>
#include <unordered_set>
#include <utility>
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

// What the import does not take of one transform's look-ats. A look-at that is reported here is not reported
// a second time as one that a bake cannot compute.
class TransformLookAts {
 public:
  TransformLookAts(const Subject& subject, NodeId transform) : subject_(subject), transform_(transform) {
    std::unordered_set<NodeId> seen;
    for (const scene::Connection* const connection : subject.scene.ConnectionsInto(transform)) {
      const NodeId source = connection->source.node;
      const bool turns = connection->destination.attribute.starts_with("rotate");
      if (turns && IsLookAt(subject.scene.node(source).type) && seen.insert(source).second)
        lookAts_.push_back({source, LastTarget(subject.scene, source)});
    }
  }

  // Of several cameras under one transform, the first is checked with all look-ats, the others with the
  // first.
  void Report(const Camera& camera) {
    for (const auto& [lookAt, target] : lookAts_) {
      ReportOne(lookAt, target, camera);
      if (!first_) break;
    }
    first_ = false;
  }

  void NoteDrivers() const {
    if (subject_.driversSaid == nullptr || said_.empty()) return;
    for (const scene::Connection* const connection : subject_.scene.ConnectionsInto(transform_)) {
      if (said_.contains(connection->source.node))
        subject_.driversSaid->insert(connection->destinationPlace.offset);
    }
  }

 private:
  void ReportOne(NodeId lookAt, const scene::Connection* target, const Camera& camera) {
    const diag::Range place = subject_.scene.node(lookAt).place;
    if (camera.layer == nullptr || !camera.layer->aimed) {
      Say(target == nullptr ? Code::LookAtShortNames : Code::LookAtNotTaken, place, lookAt, camera);
    } else if (target != nullptr && target->source.node == lookAt) {
      Say(Code::LookAtWeightLast, target->destinationPlace, lookAt, camera);
    } else {
      // The import aims the camera, whether or not a bake can compute the look-at.
      said_.insert(lookAt);
      ReportTurn(lookAt, camera);
    }
  }

  // What turns the camera about the axis that it looks along.
  void ReportTurn(NodeId lookAt, const Camera& camera) const {
    const auto numbers = [&](std::string_view attribute) {
      const auto written = subject_.scene.Written(lookAt, attribute);
      return std::pair(written, written ? written->Numbers(3) : std::vector<double>());
    };
    const auto say = [&](const diag::Range& place, std::string_view what) {
      const scene::Scene& scene = subject_.scene;
      subject_.diagnostics.Report(Code::LookAtTurnLost, place,
                                  {scene.node(lookAt).name, scene.node(camera.shape).name, what});
    };
    const auto isOther = [](double one) { return std::fabs(one) > 1e-9; };
    const auto [aimPlace, aim] = numbers("aimVector");
    if (aim.size() == 3 && (isOther(aim[0]) || isOther(aim[1]) || aim[2] >= 0.0))
      say(aimPlace->range(), "aim vector");
    for (const std::string_view attribute : {"offset", "twist"}) {
      const auto [place, angles] = numbers(attribute);
      if (std::any_of(angles.begin(), angles.end(), isOther)) say(place->range(), attribute);
    }
  }

  void Say(Code code, const diag::Range& place, NodeId lookAt, const Camera& camera) {
    const scene::Scene& scene = subject_.scene;
    subject_.diagnostics.Report(code, place, {scene.node(lookAt).name, scene.node(camera.shape).name});
    said_.insert(lookAt);
  }

  const Subject& subject_;
  NodeId transform_;
  std::vector<std::pair<NodeId, const scene::Connection*>> lookAts_;  // each once, with its target or null
  std::unordered_set<NodeId> said_;
  bool first_ = true;
};

}  // namespace

void ReportLostLookAts(const Subject& subject) {
  std::unordered_map<NodeId, TransformLookAts> lookAtsOf;
  for (const Camera& camera : subject.cameras) {
    const bool comes = camera.layer != nullptr || (camera.taken && subject.cameOver.stop != Stop::None);
    if (!comes || camera.transform == scene::kNoNode) continue;
    auto known = lookAtsOf.find(camera.transform);
    if (known == lookAtsOf.end())
      known = lookAtsOf.try_emplace(camera.transform, subject, camera.transform).first;
    known->second.Report(camera);
  }
  for (const auto& [transform, lookAts] : lookAtsOf) lookAts.NoteDrivers();
}

}  // namespace check

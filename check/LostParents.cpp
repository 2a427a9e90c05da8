// Nodes above a camera, a marked locator or a target that the importer does not find or look at.
#include <algorithm>
#include <array>
#include <string>
#include <string_view>

#include "check/Difference.h"
#include "check/RulesInternal.h"
#include "check/Times.h"

namespace check {
namespace {

using diag::Code;
using diag::Range;
using scene::NodeId;

std::string WhereItIs(const scene::Scene& scene, const scene::Node& parent) {
  for (const scene::Reference& reference : scene.references()) {
    const std::string prefix = std::string(reference.nameSpace) + ':';
    const bool fostered = IsFosterParent(parent) && parent.name.starts_with(reference.node);
    if (fostered || (prefix.size() > 1 && parent.name.starts_with(prefix))) {
      return ", but in \"" + std::string(reference.file.substr(0, 200)) + '"';
    }
  }
  return ", and in no file that is known";
}

void ReportParent(const Subject& subject, const scene::Node& node) {
  const scene::Scene& scene = subject.scene;
  const ParentLoss loss = ParentLossOf(scene, node);
  if (loss == ParentLoss::None) return;
  const Range written = WrittenParent(scene.text(), node);
  const std::string_view path =
      scene.text().substr(static_cast<std::size_t>(written.offset), static_cast<std::size_t>(written.length));
  if (node.parent == scene::kNoNode)
    return subject.diagnostics.Report(Code::ParentByCommand, node.place, {node.name, "out of", path});
  const scene::Node& parent = scene.node(node.parent);
  const Range place = written == Range{} ? node.place : written;
  if (loss == ParentLoss::Path) {
    subject.diagnostics.Report(Code::ParentIsPath, place, {node.name, path});
  } else if (loss == ParentLoss::Command) {
    subject.diagnostics.Report(Code::ParentByCommand, node.place, {node.name, "under", parent.name});
  } else if (loss == ParentLoss::Elsewhere) {
    subject.diagnostics.Report(Code::ParentElsewhere, place,
                               {node.name, parent.name, WhereItIs(scene, parent)});
  } else {
    subject.diagnostics.Report(Code::ParentNotImported, place, {node.name, parent.name, parent.type});
  }
}

// Whether the file says anything of where the transform stands.
bool IsPlaced(const Subject& subject, NodeId node) {
  constexpr std::array<std::string_view, 6> kFromZero = {"translateX", "translateY", "translateZ",
                                                         "rotateX",    "rotateY",    "rotateZ"};
  constexpr std::array<std::string_view, 3> kFromOne = {"scaleX", "scaleY", "scaleZ"};
  const auto from = [&](double neutral) {
    return [&subject, node, neutral](std::string_view one) {
      return DifferenceFrom(subject, node, one, neutral).has_value();
    };
  };
  return std::any_of(kFromZero.begin(), kFromZero.end(), from(0.0)) ||
         std::any_of(kFromOne.begin(), kFromOne.end(), from(1.0));
}

// The import aims at a target's translation, whatever stands above the target.
void ReportTarget(const Subject& subject, const Link& link) {
  const scene::Scene& scene = subject.scene;
  std::size_t length = 0;
  for (NodeId id = scene.node(link.node).parent; id != scene::kNoNode && ++length <= kLongestChain;
       id = scene.node(id).parent) {
    const bool elsewhere = scene.node(id).origin != scene::Origin::Created;
    if (!elsewhere && !IsPlaced(subject, id)) continue;
    const scene::Node& target = scene.node(link.node);
    return subject.diagnostics.Report(Code::TargetLosesItsChain, target.place,
                                      {target.name, scene.node(link.shape).name, scene.node(id).name});
  }
}

}  // namespace

void ReportLostParents(const Subject& subject) {
  for (const Camera& camera : subject.cameras) {
    if (camera.taken) ReportParent(subject, subject.scene.node(camera.shape));
  }
  for (const NodeId locator : subject.locators) ReportParent(subject, subject.scene.node(locator));
  for (const Link& link : subject.links) {
    if (link.target) {
      ReportTarget(subject, link);
    } else {
      ReportParent(subject, subject.scene.node(link.node));
    }
  }
}

}  // namespace check

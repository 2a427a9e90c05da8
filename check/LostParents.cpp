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

// What stands in quotes after "-p" in the command that created the node; empty where it is not found.
Range WrittenParent(std::string_view text, const scene::Node& node) {
  constexpr std::size_t kLongestCommand = 4000;
  constexpr std::string_view kOptions[] = {"-p \"", "-parent \""};
  const auto name = static_cast<std::size_t>(node.place.offset);
  const std::size_t earliest = name > kLongestCommand ? name - kLongestCommand : 0;
  const std::size_t begin = text.substr(earliest, name - earliest).rfind("createNode");
  if (begin == std::string_view::npos) return {};
  const std::string_view rest = text.substr(earliest + begin, 2 * kLongestCommand);
  const std::string_view command = rest.substr(0, std::min(rest.find(';'), rest.size()));
  for (const std::string_view option : kOptions) {
    const std::size_t at = command.find(option);
    if (at == std::string_view::npos) continue;
    const std::size_t start = at + option.size();
    const std::size_t end = std::min(command.find('"', start), command.size());
    return {earliest + begin + start, end - start};
  }
  return {};
}

// Stands for a node of another file.
bool IsFosterParent(const scene::Node& node) { return node.type == "fosterParent"; }

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
  if (node.parent == scene::kNoNode) return;
  const scene::Scene& scene = subject.scene;
  const Range written = WrittenParent(scene.text(), node);
  const std::string_view path =
      scene.text().substr(static_cast<std::size_t>(written.offset), static_cast<std::size_t>(written.length));
  const scene::Node& parent = scene.node(node.parent);
  const Range place = written == Range{} ? node.place : written;
  if (path.find('|') != std::string_view::npos) {
    subject.diagnostics.Report(Code::ParentIsPath, place, {node.name, path});
  } else if (parent.origin != scene::Origin::Created || IsFosterParent(parent)) {
    subject.diagnostics.Report(Code::ParentElsewhere, place,
                               {node.name, parent.name, WhereItIs(scene, parent)});
  } else if (!IsImportedTransform(parent.type)) {
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

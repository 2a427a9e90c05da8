// Nodes above a camera, a marked locator or a target that the importer does not find or look at.
#include <algorithm>
#include <array>
#include <string>
#include <string_view>
#include <unordered_map>

#include "check/Difference.h"
#include "check/LookAts.h"
#include "check/RulesInternal.h"
#include "check/Times.h"

namespace check {
namespace {

using diag::Code;
using diag::Range;
using scene::NodeId;

// Finds the file of a name. Where several references have one, the first that is written counts.
class References {
 public:
  explicit References(const scene::Scene& scene) {
    for (const scene::Reference& reference : scene.references()) {
      bySpace_.try_emplace(reference.nameSpace, &reference);
      byNode_.try_emplace(reference.node, &reference);
    }
  }

  std::string WhereItIs(const scene::Node& parent) const {
    const scene::Reference* found = OfSpace(parent.name);
    if (IsFosterParent(parent)) {
      const scene::Reference* const other = OfNode(parent.name);
      if (found == nullptr || (other != nullptr && other < found)) found = other;
    }
    if (found == nullptr) return ", and in no file that is known";
    return ", but in \"" + std::string(found->file.substr(0, 200)) + '"';
  }

 private:
  using Map = std::unordered_map<std::string_view, const scene::Reference*>;

  // Name spaces can be nested: "a:b:root" belongs to "a" and to "a:b".
  const scene::Reference* OfSpace(std::string_view name) const {
    const scene::Reference* found = nullptr;
    std::size_t looked = 0;
    for (std::size_t end = name.find(':'); end != std::string_view::npos && ++looked <= kMostSpaces;
         end = name.find(':', end + 1)) {
      if (end != 0) found = Earlier(found, bySpace_, name.substr(0, end));
    }
    return found;
  }

  // The name of a foster parent begins with that of the reference's node.
  const scene::Reference* OfNode(std::string_view name) const {
    const scene::Reference* found = nullptr;
    name = name.substr(0, kLongestNode);
    for (std::size_t length = 0; length <= name.size(); ++length)
      found = Earlier(found, byNode_, name.substr(0, length));
    return found;
  }

  static const scene::Reference* Earlier(const scene::Reference* found, const Map& map,
                                         std::string_view name) {
    const auto known = map.find(name);
    if (known == map.end() || (found != nullptr && found < known->second)) return found;
    return known->second;
  }

  // The rest of a longer name is not looked at: many parents may have long names.
  static constexpr std::size_t kMostSpaces = 64;
  static constexpr std::size_t kLongestNode = 256;

  Map bySpace_;
  Map byNode_;
};

void ReportParent(const Subject& subject, const References& references, const scene::Node& node) {
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
                               {node.name, parent.name, references.WhereItIs(parent)});
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
  const References references(subject.scene);
  for (const Camera& camera : subject.cameras) {
    if (camera.taken) ReportParent(subject, references, subject.scene.node(camera.shape));
  }
  for (const NodeId locator : subject.locators)
    ReportParent(subject, references, subject.scene.node(locator));
  for (const Link& link : subject.links) {
    if (link.target) {
      // A camera that is aimed at a look-at is aimed there by mistake, of which LostLookAts.cpp speaks.
      if (!IsLookAt(subject.scene.node(link.node).type)) ReportTarget(subject, link);
    } else {
      ReportParent(subject, references, subject.scene.node(link.node));
    }
  }
}

}  // namespace check

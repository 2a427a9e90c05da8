// Names that are one for the importer, or none.
#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <deque>
#include <string>
#include <string_view>
#include <unordered_set>
#include <utility>
#include <vector>

#include "check/ReadingEnd.h"
#include "check/RulesInternal.h"
#include "scene/FlatMap.h"

namespace check {
namespace {

using diag::Code;
using scene::NodeId;

// The importer's lists of nodes.
enum class List : std::uint8_t { None, Transforms, Cameras, Curves, Locators };

constexpr std::array<std::pair<std::string_view, List>, 10> kTypes = {{
    {"transform", List::Transforms},
    {"stereoRigTransform", List::Transforms},
    {"lookAt", List::Transforms},
    {"aimConstraint", List::Transforms},
    {"camera", List::Cameras},
    {"stereoRigCamera", List::Cameras},
    {"animCurveTL", List::Curves},
    {"animCurveTA", List::Curves},
    {"animCurveTU", List::Curves},
    {"locator", List::Locators},
}};

List ListOf(const scene::Node& node) {
  if (node.origin != scene::Origin::Created) return List::None;
  const auto* const found = std::find_if(kTypes.begin(), kTypes.end(),
                                         [&](const auto& type) { return SameName(type.first, node.type); });
  return found == kTypes.end() ? List::None : found->second;
}

// The names that decide how a camera or a null comes over: of what stands above it, and of what drives that.
class NamesThatCount {
 public:
  explicit NamesThatCount(const Subject& subject) {
    const auto add = [&](NodeId id) {
      const std::string_view name = ImportName(subject.scene, subject.scene.node(id));
      if (!name.empty()) Add(name);
    };
    const auto addWithDrivers = [&](NodeId id) {
      add(id);
      for (const scene::Connection* const connection : subject.scene.ConnectionsInto(id))
        add(connection->source.node);
    };
    for (const Camera& camera : subject.cameras) {
      if (camera.taken) addWithDrivers(camera.shape);
    }
    for (const Link& link : subject.links) addWithDrivers(link.node);
    const auto addLostParent = [&](NodeId id) {
      const NodeId parent = subject.scene.node(id).parent;
      if (parent == scene::kNoNode || ParentLossOf(subject.scene, subject.scene.node(id)) == ParentLoss::None)
        return;
      add(parent);
      lostParents_.insert(parent);
    };
    for (const Camera& camera : subject.cameras) {
      if (camera.taken) addLostParent(camera.shape);
    }
    for (const NodeId locator : subject.locators) addLostParent(locator);
    for (const Link& link : subject.links) addLostParent(link.node);
  }

  // A parent that does not come over counts too: the importer looks for its name, and can find another
  // node's.
  bool IsLostParent(NodeId id) const { return lostParents_.contains(id); }

  // Adds a node of the list. Gives the name of the earlier node of the same name; empty where there is none,
  // and where the name does not count.
  std::string_view Meet(List list, std::string_view name) {
    const std::uint32_t* const number = numbers_.Find(0, Lowered(name));
    if (number == nullptr) return {};
    std::string_view& first = met_[*number - 1][static_cast<std::size_t>(list)];
    if (!first.empty()) return first;
    first = name;
    return {};
  }

 private:
  static constexpr std::size_t kLists = 5;

  // The name without case. It lasts until the next call, so that no node needs memory of its own.
  std::string_view Lowered(std::string_view name) {
    lowered_.assign(name);
    for (char& c : lowered_) c = c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
    return lowered_;
  }

  void Add(std::string_view name) {
    if (numbers_.Find(0, Lowered(name)) != nullptr) return;
    met_.emplace_back();
    const auto number = static_cast<std::uint32_t>(met_.size());
    numbers_.At(0, names_.emplace_back(lowered_)) = number;
  }

  std::string lowered_;
  std::deque<std::string> names_;  // without case
  scene::FlatMap<std::uint32_t> numbers_;
  std::unordered_set<NodeId> lostParents_;
  std::vector<std::array<std::string_view, kLists>> met_;  // by number and list, the first one of the file
};

void ReportNamesake(const Subject& subject, const scene::Node& node, std::string_view name,
                    std::string_view first) {
  if (first == name) {
    subject.diagnostics.Report(Code::SameNames, node.place, {name});
  } else {
    subject.diagnostics.Report(Code::NamesDifferInCase, node.place, {first, name});
  }
}

// Of a node without a name the place is that of its type.
void ReportUnusableName(const Subject& subject, const scene::Node& node) {
  if (node.place.length > 252) {
    subject.diagnostics.Report(Code::NameTooLong, node.place, {std::to_string(node.place.length)});
  } else {
    subject.diagnostics.Report(Code::NodeWithoutName, node.place, {node.type});
  }
}

void ReportTextAfterNul(const Subject& subject) {
  const std::string_view text = subject.scene.text();
  if (subject.cameOver.stop != Stop::None || text.find('\0') == std::string_view::npos) return;
  const ReadingEnd end = FindReadingEnd(text);
  if (end.kind != ReadingEnd::Kind::Nul) return;
  const std::string_view rest = text.substr(end.offset + 1);
  if (rest.find_first_not_of(std::string_view(" \t\r\n\0", 5)) == std::string_view::npos) return;
  subject.diagnostics.Report(Code::TextAfterNul, {end.offset, 1}, {std::to_string(rest.size())});
}

}  // namespace

void ReportNames(const Subject& subject) {
  NamesThatCount names(subject);
  for (NodeId id = 0; id < subject.scene.nodes().size(); ++id) {
    const scene::Node& node = subject.scene.node(id);
    const List list = names.IsLostParent(id) ? List::Transforms : ListOf(node);
    if (list == List::None) continue;
    const std::string_view name = ImportName(subject.scene, node);
    if (name.empty()) {
      // What the file does not create has no name of its own.
      if (node.origin == scene::Origin::Created) ReportUnusableName(subject, node);
    } else if (const std::string_view first = names.Meet(list, name); !first.empty()) {
      ReportNamesake(subject, node, name, first);
    }
  }
  ReportTextAfterNul(subject);
}

}  // namespace check

// Names that are one for the importer, or none.
#include <algorithm>
#include <array>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>

#include "check/ReadingEnd.h"
#include "check/RulesInternal.h"

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

std::string Lowered(std::string_view name) {
  std::string lowered(name);
  for (char& c : lowered) c = c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
  return lowered;
}

// The names that decide how a camera or a null comes over: of what stands above it, and of what drives that.
std::unordered_map<std::string, std::string_view> NamesThatCount(const Subject& subject) {
  std::unordered_map<std::string, std::string_view>
      names;  // without case: the first one of the file, when met
  const auto add = [&](NodeId id) {
    names.emplace(Lowered(ImportName(subject.scene, subject.scene.node(id))), "");
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
  names.erase("");
  return names;
}

void ReportNamesakes(const Subject& subject) {
  std::unordered_map<std::string, std::string_view> counting = NamesThatCount(subject);
  std::unordered_map<std::string, std::string_view> met;
  for (const scene::Node& node : subject.scene.nodes()) {
    const List list = ListOf(node);
    const std::string_view name = ImportName(subject.scene, node);
    if (list == List::None || name.empty()) continue;
    std::string key = Lowered(name);
    if (!counting.contains(key)) continue;
    key += static_cast<char>('0' + static_cast<int>(list));
    const auto [first, added] = met.emplace(std::move(key), name);
    if (added) continue;
    if (first->second == name) {
      subject.diagnostics.Report(Code::SameNames, node.place, {name});
    } else {
      subject.diagnostics.Report(Code::NamesDifferInCase, node.place, {first->second, name});
    }
  }
}

void ReportUnusableNames(const Subject& subject) {
  for (const scene::Node& node : subject.scene.nodes()) {
    if (ListOf(node) == List::None || !ImportName(subject.scene, node).empty()) continue;
    // Of a node without a name the place is that of its type.
    if (node.place.length > 252) {
      subject.diagnostics.Report(Code::NameTooLong, node.place, {std::to_string(node.place.length)});
    } else {
      subject.diagnostics.Report(Code::NodeWithoutName, node.place, {node.type});
    }
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
  ReportNamesakes(subject);
  ReportUnusableNames(subject);
  ReportTextAfterNul(subject);
}

}  // namespace check

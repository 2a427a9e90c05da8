// Values that a scene stores and the importer does not read.
#include <algorithm>
#include <bitset>
#include <cmath>
#include <map>
#include <optional>
#include <string>
#include <vector>

#include "check/Curves.h"
#include "check/RulesInternal.h"
#include "check/SetCommands.h"
#include "text/Numbers.h"

namespace check {
namespace {

using scene::NodeId;

// Nobody sees a smaller difference. The importer's own aperture is rounded more than that.
constexpr double kSameNumber = 1e-6;
constexpr double kSameAperture = 1e-4;

// What one command says in vain.
struct Skipped {
  std::string components, imported, stored;
  diag::Range place;
};

void Add(std::string_view what, std::string* list) {
  if (!list->empty()) *list += ", ";
  *list += what;
}

class Values {
 public:
  Values(const Subject& subject, NodeId node) : subject_(subject), node_(node) {}

  // Of a target no more than the translation is taken.
  void Report(bool target) {
    const std::vector<const ReadAttribute*> known = ReadAttributesOf(scene().node(node_).type);
    FindTouched(known);
    if (touched_.none()) return;
    commands_ = CommandsAfter(scene(), node_);
    for (std::size_t which = 0; which < known.size(); ++which) {
      const ReadAttribute* const attribute = known[which];
      if (!touched_[which] || (target && attribute->longName != ".translate")) continue;
      if (!inParts_[which] && IsRead(*attribute)) continue;
      for (std::size_t i = 0; i < std::size(attribute->components) && !attribute->components[i].empty();
           ++i) {
        Compare(*attribute, i);
      }
    }
    for (const auto& [value, skipped] : skipped_) {
      const std::string why(WhyNot(value));
      subject_.diagnostics.Report(
          diag::Code::StoredValueSkipped, skipped.place,
          {scene().node(node_).name, skipped.imported, skipped.components, skipped.stored, why});
    }
  }

 private:
  const scene::Scene& scene() const { return subject_.scene; }

  // Notes which attributes have a value, and which have one for a single component.
  void FindTouched(const std::vector<const ReadAttribute*>& known) {
    scene().ForEachTouched(node_, [&](std::string_view name) {
      for (std::size_t which = 0; which < known.size(); ++which) {
        const auto& components = known[which]->components;
        const bool whole = known[which]->longName.substr(1) == name;
        const bool part =
            !whole && std::find(std::begin(components), std::end(components), name) != std::end(components);
        if (whole || part) touched_.set(which);
        if (part) inParts_.set(which);
      }
    });
  }

  // Whether the importer reads the command that sets the attribute as a whole.
  bool IsRead(const ReadAttribute& attribute) const {
    const auto written = scene().Written(node_, attribute.components[0]);
    const SetCommand* const command = written ? CommandOf(written->range().offset) : nullptr;
    return command != nullptr && command->attribute == &attribute;
  }

  // The command after the createNode in which the value stands.
  const SetCommand* CommandOf(std::uint64_t value) const {
    const auto found = std::find_if(commands_.begin(), commands_.end(), [value](const SetCommand& command) {
      return command.begin <= value && value < command.end;
    });
    return found == commands_.end() ? nullptr : &*found;
  }

  std::string_view WhyNot(std::uint64_t value) const {
    if (const SetCommand* const command = CommandOf(value)) return command->why;
    const auto command = CommandAround(scene(), node_, value);
    return command && command->why == "names its node" ? command->why : "does not follow its createNode";
  }

  void Compare(const ReadAttribute& attribute, std::size_t component) {
    const std::string_view name = attribute.components[component];
    const auto written = scene().Written(node_, name);
    const auto stored = written ? written->Number() : std::nullopt;
    if (!stored) return;
    const SetCommand* const command = CommandOf(written->range().offset);
    if (command != nullptr && command->attribute == &attribute) return;
    const double imported = NumberRead(commands_, attribute, component);
    if (IsSame(name, *stored, imported) || !Counts(name, *stored)) return;
    Skipped& skipped = skipped_[written->range().offset];
    skipped.place = written->range();
    Add(name, &skipped.components);
    Add(text::ShortestNumber(imported), &skipped.imported);
    Add(text::ShortestNumber(*stored), &skipped.stored);
  }

  // The importer knows the vertical fit and no others.
  static bool IsSame(std::string_view name, double stored, double imported) {
    if (name == "filmFit") return (stored == 2.0) == (imported == 2.0);
    const double same = name.ends_with("Aperture") ? kSameAperture : kSameNumber;
    return std::fabs(stored - imported) <= same * std::max(1.0, std::fabs(stored));
  }

  // Other rules report what comes over of a driven channel, but not where the stored value is that of the
  // only key.
  bool Counts(std::string_view name, double stored) const {
    if (!scene().SourceOf(scene().PlugOf(node_, name))) return true;
    bool counts = false;
    for (const KeyedChannel& keyed : subject_.channels.KeyedOf(node_)) {
      if (keyed.keys > 1) return false;
      if (keyed.channel == name)
        counts = keyed.keys == 1 && std::fabs(stored - keyed.firstValue) <= kSameNumber;
    }
    return counts;
  }

  const Subject& subject_;
  NodeId node_;
  std::bitset<8> touched_;  // of the known attributes
  std::bitset<8> inParts_;
  std::vector<SetCommand> commands_;
  std::map<std::uint64_t, Skipped> skipped_;  // by the place of the value
};

}  // namespace

void ReportStoredValues(const Subject& subject) {
  for (const Link& link : subject.links) Values(subject, link.node).Report(link.target);
  for (const Camera& camera : subject.cameras) {
    if (camera.taken) Values(subject, camera.shape).Report(false);
  }
}

}  // namespace check

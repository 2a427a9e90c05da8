// Attributes, connections and the head of the file.
#include "scene/SceneBuilder.h"

#include <algorithm>
#include <utility>

#include "scene/ByteClasses.h"

namespace scene {
namespace {

// The largest index of an array.
constexpr std::uint32_t kLastElement = 0x7ffffffe;

std::uint64_t KeyOf(const Plug& plug) {
  return std::uint64_t{plug.node} << 32 | static_cast<std::uint32_t>(plug.index);
}

}  // namespace

bool SceneBuilder::Keeps(NodeId node, std::string_view attribute) const {
  return scene_.types_[node] != TypeNumber::Unknown || scene_.InfoOf(node, attribute) != nullptr ||
         scene_.Added(node, attribute) != nullptr;
}

void SceneBuilder::Set(NodeId node, const AttributePath& path, std::uint32_t value,
                       std::uint32_t valueLength) {
  while (valueLength != 0 && IsByte(scene_.text_[value + valueLength - 1], kSpaceByte)) --valueLength;
  const Plug plug = scene_.PlugOf(node, path.name, path.first);
  scene_.settings_.push_back({.attribute = plug.attribute,
                              .node = node,
                              .value = value,
                              .valueLength = valueLength,
                              .first = path.first,
                              .last = path.last});
}

// An attribute that the node's type has already is not added.
void SceneBuilder::AddAttribute(AddedAttribute attribute, NodeId node) {
  if (scene_.InfoOf(node, attribute.longName) != nullptr) return;
  attribute.node = node;
  const auto index = static_cast<std::uint32_t>(scene_.added_.size());
  const AddedAttribute* const compound =
      attribute.compound.empty() ? nullptr : scene_.Added(node, attribute.compound);
  attribute.compound = {};
  if (compound != nullptr) {
    AddedAttribute& whole = scene_.added_[static_cast<std::size_t>(compound - scene_.added_.data())];
    attribute.compound = whole.longName;
    attribute.component = static_cast<int>(whole.components.size());
    whole.components.push_back(index);
  }
  scene_.addedByName_.At(node, attribute.longName).plusOne = index + 1;
  scene_.addedByName_.At(node, attribute.shortName).plusOne = index + 1;
  scene_.added_.push_back(std::move(attribute));
}

Plug SceneBuilder::PlugOf(Named plug) {
  const PlugText parts = SplitPlug(plug.text);
  return scene_.PlugOf(Resolve({parts.node, plug.place}), parts.attribute);
}

void SceneBuilder::Index(std::uint32_t connection) {
  const Plug& plug = scene_.connections_[connection].destination;
  scene_.connectionByName_.At(KeyOf(plug), plug.attribute).plusOne = connection + 1;
}

// The last connection that -na made from the source to an element of the destination.
Scene::IndexOfOne& SceneBuilder::Appended(const Plug& source, const Plug& destination) {
  const std::uint64_t from = HashOf(source.attribute, KeyOf(source));
  return appended_.At(from ^ HashOf({}, destination.node), destination.attribute);
}

void SceneBuilder::Connect(Named source, Named destination, ConnectHow how) {
  Connection connection{PlugOf(source), PlugOf(destination), source.place, destination.place};
  Plug& to = connection.destination;
  const bool appends = how == ConnectHow::NextAvailable && to.index == kNoIndex;
  if (appends || to.index != kNoIndex) {
    std::uint32_t& next = nextElements_.At(to.node, to.attribute).next;
    if (appends) to.index = static_cast<std::int32_t>(std::min(next, kLastElement));
    next = std::max(next, static_cast<std::uint32_t>(to.index) + 1);
  }
  if (const Connection* const there = scene_.ConnectionTo(to)) {
    if (there->source == connection.source) return;
    if (how != ConnectHow::Force) {
      const auto written = [this](const diag::Range& place) {
        return scene_.text_.substr(place.offset, place.length);
      };
      return Note({diag::Code::AlreadyConnected,
                   to.node,
                   destination.place,
                   {written(destination.place), written(there->sourcePlace)}});
    }
    Cut(static_cast<std::uint32_t>(there - scene_.connections_.data()));
  }
  scene_.connections_.push_back(connection);
  scene_.connectionLinks_.emplace_back();
  const auto made = static_cast<std::uint32_t>(scene_.connections_.size() - 1);
  Index(made);
  if (appends) Appended(connection.source, to).plusOne = made + 1;
}

void SceneBuilder::Cut(std::uint32_t connection) {
  const Plug& to = scene_.connections_[connection].destination;
  scene_.connectionLinks_[connection].cut = true;
  scene_.connectionByName_.At(KeyOf(to), to.attribute).plusOne = 0;
}

void SceneBuilder::Disconnect(const Named& source, const Named& destination, bool nextAvailable) {
  const Plug from = PlugOf(source);
  Plug to = PlugOf(destination);
  if (nextAvailable && to.index == kNoIndex) {
    Scene::IndexOfOne& appended = Appended(from, to);
    if (appended.plusOne == 0) return;
    to.index = scene_.connections_[appended.plusOne - 1].destination.index;
    appended.plusOne = 0;
  }
  const Connection* const there = scene_.ConnectionTo(to);
  if (there == nullptr || there->source != from) return;
  Cut(static_cast<std::uint32_t>(there - scene_.connections_.data()));
}

void SceneBuilder::AddReference(const Reference& reference, bool read) {
  Scene::IndexOfOne& known = referenceByName_.At(0, reference.node);
  if (known.plusOne == 0) {
    scene_.references_.push_back(reference);
    known.plusOne = static_cast<std::uint32_t>(scene_.references_.size());
    referenceBySpace_.At(0, reference.nameSpace).plusOne = known.plusOne;
  }
  if (read && referencesRead_++ == 0) firstRead_ = reference;
}

void SceneBuilder::Note(const NodeNote& note) {
  if (notes_ != nullptr) return notes_->push_back(note);
  Report(note, diagnostics_);
}

void Report(const NodeNote& note, diag::Collector* diagnostics) {
  const auto& [a, b, c] = note.arguments;
  if (note.code == diag::Code::ParentInReference)
    return diagnostics->Report(note.code, note.place, {a, b, c});
  diagnostics->Report(note.code, note.place, {a, b});
}

}  // namespace scene

// Attributes, connections and the head of the file.
#include "scene/SceneBuilder.h"

#include "scene/ByteClasses.h"

namespace scene {
namespace {

std::uint64_t KeyOf(const Plug& plug) {
  return std::uint64_t{plug.node} << 32 | static_cast<std::uint32_t>(plug.index);
}

}  // namespace

bool SceneBuilder::Keeps(NodeId node, std::string_view attribute) const {
  const std::string_view type = scene_.nodes_[node].type;
  return KeepsAttributes(type) || FindAttribute(type, attribute) != nullptr;
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

void SceneBuilder::AddAttribute(AddedAttribute attribute, NodeId node) {
  if (!KeepsAttributes(scene_.nodes_[node].type)) return;
  attribute.node = node;
  scene_.added_.push_back(attribute);
  const auto plusOne = static_cast<std::uint32_t>(scene_.added_.size());
  scene_.addedByName_.At(attribute.node, attribute.longName).plusOne = plusOne;
  scene_.addedByName_.At(attribute.node, attribute.shortName).plusOne = plusOne;
}

Plug SceneBuilder::PlugOf(Named plug) {
  const PlugText parts = SplitPlug(plug.text);
  return scene_.PlugOf(Resolve({parts.node, plug.place}), parts.attribute);
}

void SceneBuilder::Index(std::uint32_t connection) {
  const Plug& plug = scene_.connections_[connection].destination;
  scene_.connectionByName_.At(KeyOf(plug), plug.attribute).plusOne = connection + 1;
}

void SceneBuilder::Connect(Named source, Named destination, ConnectHow how) {
  Connection connection{PlugOf(source), PlugOf(destination), source.place, destination.place};
  if (how != ConnectHow::NextAvailable) {
    if (const Connection* const there = scene_.ConnectionTo(connection.destination)) {
      if (there->source == connection.source) return;
      const auto at = static_cast<std::size_t>(there - scene_.connections_.data());
      if (how == ConnectHow::Plain) {
        const std::string_view driver =
            scene_.text_.substr(there->sourcePlace.offset, there->sourcePlace.length);
        diagnostics_->Report(diag::Code::AlreadyConnected, destination.place, {destination.text, driver});
        return;
      }
      scene_.connectionLinks_[at].cut = true;
    }
  }
  scene_.connections_.push_back(connection);
  scene_.connectionLinks_.emplace_back();
  if (how != ConnectHow::NextAvailable) Index(static_cast<std::uint32_t>(scene_.connections_.size() - 1));
}

void SceneBuilder::Disconnect(const Named& source, const Named& destination) {
  const Plug from = PlugOf(source);
  const Plug to = PlugOf(destination);
  const Connection* const there = scene_.ConnectionTo(to);
  if (there == nullptr || there->source != from) return;
  scene_.connectionLinks_[static_cast<std::size_t>(there - scene_.connections_.data())].cut = true;
  scene_.connectionByName_.At(KeyOf(to), to.attribute).plusOne = 0;
}

void SceneBuilder::AddReference(const Reference& reference, bool read) {
  Scene::IndexOfOne& known = referenceByName_.At(0, reference.node);
  if (known.plusOne == 0) {
    scene_.references_.push_back(reference);
    known.plusOne = static_cast<std::uint32_t>(scene_.references_.size());
    referenceBySpace_.At(0, reference.nameSpace).plusOne = known.plusOne;
  }
  if (read) diagnostics_->Report(diag::Code::ReferenceNotRead, reference.place, {reference.file});
}

}  // namespace scene

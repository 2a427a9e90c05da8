#include "scene/Scene.h"

#include <algorithm>

namespace scene {
namespace {

std::uint64_t KeyOf(NodeId node, std::int32_t index) {
  return std::uint64_t{node} << 32 | static_cast<std::uint32_t>(index);
}

}  // namespace

std::string Scene::PathOf(NodeId id, std::size_t longest) const {
  constexpr std::string_view kRest = "...";
  std::vector<NodeId> chain;
  std::size_t length = 0;
  NodeId at = id;
  for (; at != kNoNode; at = nodes_[at].parent) {
    const std::size_t own = nodes_[at].name.size() + 1;
    if (own > longest - length && !chain.empty()) break;
    length = own > longest - length ? longest : length + own;
    chain.push_back(at);
  }
  std::string path(at == kNoNode ? "" : kRest);
  for (auto one = chain.rbegin(); one != chain.rend(); ++one) {
    const Node& node = nodes_[*one];
    if (!path.empty() || node.origin == Origin::Created) path += '|';
    path += node.name.substr(0, longest);
  }
  return path;
}

const AddedAttribute* Scene::Added(NodeId node, std::string_view name) const {
  const IndexOfOne* const found = addedByName_.Find(node, name);
  return found == nullptr || found->plusOne == 0 ? nullptr : &added_[found->plusOne - 1];
}

Plug Scene::PlugOf(NodeId node, std::string_view attribute) const {
  const AttributePath path = ParseAttributePath(attribute);
  return PlugOf(node, path.name, path.first);
}

Plug Scene::PlugOf(NodeId node, std::string_view attribute, std::int32_t index) const {
  if (const AttributeInfo* const info = InfoOf(node, attribute)) {
    return {node, info->longName, index};
  }
  if (const AddedAttribute* const added = Added(node, attribute)) return {node, added->longName, index};
  return {node, attribute, index};
}

Scene::Form Scene::FormOf(const AttributeInfo& info) {
  const std::string_view compound = info.compound == nullptr ? std::string_view() : info.compound->longName;
  return {compound, info.component, std::max<std::size_t>(1, info.components.size())};
}

Scene::Form Scene::FormOf(NodeId node, std::string_view attribute) const {
  if (const AttributeInfo* const info = InfoOf(node, attribute)) return FormOf(*info);
  const AddedAttribute* const added = Added(node, attribute);
  if (added == nullptr) return {};
  return {added->compound, added->component, std::max<std::size_t>(1, added->components.size())};
}

// The name of a component; empty where the components are not known.
std::string_view Scene::ComponentOf(NodeId node, std::string_view compound, int component) const {
  const auto place = static_cast<std::size_t>(component);
  if (const AttributeInfo* const info = InfoOf(node, compound)) {
    return place < info->components.size() ? std::string_view(info->components[place]->longName)
                                           : std::string_view();
  }
  const AddedAttribute* const added = Added(node, compound);
  const bool known = added != nullptr && place < added->components.size();
  return known ? added_[added->components[place]].longName : std::string_view();
}

// ---- values ----

Value Scene::ValueOf(const Setting& setting, std::size_t component) const {
  return {text_.substr(setting.value, setting.valueLength), setting.value, component};
}

std::optional<Value> Scene::Written(NodeId node, std::string_view attribute, std::int32_t index) const {
  if (lists_[node].firstSetting == kNone) return std::nullopt;
  const AttributeInfo* const info = InfoOf(node, attribute);
  const Plug plug = info != nullptr ? Plug{node, info->longName, index} : PlugOf(node, attribute, index);
  const Form form = info != nullptr ? FormOf(*info) : FormOf(node, plug.attribute);
  const std::uint32_t own = settingIndex_.Find(settings_, plug);
  const std::uint32_t whole =
      form.compound.empty() ? kNone : settingIndex_.Find(settings_, {node, form.compound, index});
  if (own == kNone && whole == kNone) return std::nullopt;
  // The later one counts. How many numbers an element has, and which of them is asked for, depends on it.
  const bool byCompound = whole != kNone && (own == kNone || own < whole);
  const Setting& setting = settings_[byCompound ? whole : own];
  const std::size_t width = byCompound ? FormOf(node, form.compound).width : form.width;
  const auto element = static_cast<std::size_t>(index - setting.first);
  return ValueOf(setting, element * width + static_cast<std::size_t>(byCompound ? form.component : 0));
}

std::vector<std::string_view> Scene::TouchedAttributes(NodeId node) const {
  std::vector<std::string_view> touched;
  ForEachTouched(node, [&touched](std::string_view attribute) { touched.push_back(attribute); });
  return touched;
}

std::optional<double> Scene::Default(NodeId node, std::string_view attribute) const {
  if (const AttributeInfo* const info = InfoOf(node, attribute)) return info->fallback;
  const AddedAttribute* const added = Added(node, attribute);
  return added == nullptr ? std::nullopt : added->fallback;
}

std::optional<double> Scene::Number(NodeId node, std::string_view attribute, std::int32_t index) const {
  const std::optional<Value> written = Written(node, attribute, index);
  return written ? written->Number() : Default(node, attribute);
}

std::vector<Piece> Scene::Pieces(NodeId node, std::string_view attribute) const {
  const Plug plug = PlugOf(node, attribute, kNoIndex);
  std::vector<Piece> pieces;
  for (std::uint32_t at = lists_[node].firstSetting; at != kNone; at = settings_[at].next) {
    const Setting& setting = settings_[at];
    if (setting.attribute != plug.attribute || setting.first == kNoIndex) continue;
    pieces.push_back({setting.first, setting.last, ValueOf(setting, 0)});
  }
  return pieces;
}

// ---- connections ----

const Connection* Scene::ConnectionTo(const Plug& plug) const {
  const IndexOfOne* const found = connectionByName_.Find(KeyOf(plug.node, plug.index), plug.attribute);
  if (found == nullptr || found->plusOne == 0) return nullptr;
  return &connections_[found->plusOne - 1];
}

std::optional<Driver> Scene::SourceOf(const Plug& plug) const {
  if (!IsDriven(plug.node)) return std::nullopt;
  if (const Connection* const own = ConnectionTo(plug)) return Driver{own->source, -1, own};
  const Form form = FormOf(plug.node, plug.attribute);
  if (form.compound.empty()) return std::nullopt;
  const Connection* const whole = ConnectionTo({plug.node, form.compound, plug.index});
  if (whole == nullptr) return std::nullopt;
  Driver driver{whole->source, form.component, whole};
  const std::string_view component = ComponentOf(driver.plug.node, driver.plug.attribute, form.component);
  if (!component.empty()) {
    driver.plug.attribute = component;
    driver.component = -1;
  }
  return driver;
}

std::vector<Plug> Scene::DestinationsOf(const Plug& plug) const {
  const Form form = FormOf(plug.node, plug.attribute);
  std::vector<Plug> destinations;
  for (const Connection* const connection : ConnectionsFrom(plug.node)) {
    const Plug& source = connection->source;
    if (source.index != plug.index) continue;
    Plug destination = connection->destination;
    if (source.attribute == form.compound) {
      destination.attribute = ComponentOf(destination.node, destination.attribute, form.component);
      if (destination.attribute.empty()) continue;
    } else if (source.attribute != plug.attribute &&
               FormOf(plug.node, source.attribute).compound != plug.attribute) {
      continue;
    }
    destinations.push_back(destination);
  }
  return destinations;
}

std::vector<const Connection*> Scene::ConnectionsInto(NodeId node) const {
  std::vector<const Connection*> into;
  for (std::uint32_t at = lists_[node].firstInto; at != kNone; at = connectionLinks_[at].nextInto) {
    into.push_back(&connections_[at]);
  }
  return into;
}

std::vector<const Connection*> Scene::ConnectionsFrom(NodeId node) const {
  std::vector<const Connection*> from;
  for (std::uint32_t at = lists_[node].firstFrom; at != kNone; at = connectionLinks_[at].nextFrom) {
    from.push_back(&connections_[at]);
  }
  return from;
}

}  // namespace scene

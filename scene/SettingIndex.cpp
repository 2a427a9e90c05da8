#include "scene/SettingIndex.h"

#include <algorithm>
#include <queue>

namespace scene {
namespace {

// The settings node by node; those of a node by attribute, then by their first elements.
std::vector<std::uint32_t> Ordered(std::span<const Setting> settings, std::size_t nodeCount) {
  std::vector<std::uint32_t> ends(nodeCount + 1);
  for (const Setting& setting : settings) ++ends[setting.node + 1];
  for (std::size_t node = 0; node < nodeCount; ++node) ends[node + 1] += ends[node];
  std::vector<std::uint32_t> order(settings.size());
  for (std::uint32_t at = 0; at < settings.size(); ++at) order[ends[settings[at].node]++] = at;
  std::uint32_t start = 0;
  for (std::size_t node = 0; node < nodeCount; ++node) {
    std::sort(order.begin() + start, order.begin() + ends[node], [&](std::uint32_t a, std::uint32_t b) {
      const int names = settings[a].attribute.compare(settings[b].attribute);
      return names != 0 ? names < 0 : settings[a].first < settings[b].first;
    });
    start = ends[node];
  }
  return order;
}

}  // namespace

SettingIndex::SettingIndex(std::span<const Setting> settings, std::size_t nodeCount) {
  const std::vector<std::uint32_t> order = Ordered(settings, nodeCount);
  parts_.reserve(settings.size());
  firstPart_.reserve(nodeCount + 1);
  std::size_t at = 0;
  for (std::size_t node = 0; node < nodeCount; ++node) {
    firstPart_.push_back(parts_.size());
    while (at < order.size() && settings[order[at]].node == node) {
      const std::size_t start = at;
      const std::string_view attribute = settings[order[at]].attribute;
      do {
        ++at;
      } while (at < order.size() && settings[order[at]].node == node &&
               settings[order[at]].attribute == attribute);
      AddParts(settings, std::span(order).subspan(start, at - start));
    }
  }
  firstPart_.push_back(parts_.size());
}

// Goes over the elements in ascending order. `open` holds the settings that may cover the element. The one on
// top, the last in the file, counts up to its end or to the start of the next setting.
void SettingIndex::AddParts(std::span<const Setting> settings, std::span<const std::uint32_t> ofAttribute) {
  std::priority_queue<std::uint32_t> open;
  std::size_t next = 0;
  std::int64_t element = 0;
  while (!open.empty() || next < ofAttribute.size()) {
    if (open.empty()) element = settings[ofAttribute[next]].first;
    while (next < ofAttribute.size() && settings[ofAttribute[next]].first == element) {
      open.push(ofAttribute[next++]);
    }
    const std::uint32_t counts = open.top();
    std::int64_t last = settings[counts].last;
    if (next < ofAttribute.size()) last = std::min<std::int64_t>(last, settings[ofAttribute[next]].first - 1);
    parts_.push_back({static_cast<std::int32_t>(element), static_cast<std::int32_t>(last), counts});
    element = last + 1;
    while (!open.empty() && settings[open.top()].last < element) open.pop();
  }
}

std::uint32_t SettingIndex::Find(std::span<const Setting> settings, const Plug& plug) const {
  const auto begin = parts_.begin() + static_cast<std::ptrdiff_t>(firstPart_[plug.node]);
  const auto end = parts_.begin() + static_cast<std::ptrdiff_t>(firstPart_[plug.node + 1]);
  const auto found = std::partition_point(begin, end, [&](const Part& part) {
    const int names = settings[part.setting].attribute.compare(plug.attribute);
    return names != 0 ? names < 0 : part.last < plug.index;
  });
  const bool fits =
      found != end && settings[found->setting].attribute == plug.attribute && found->first <= plug.index;
  return fits ? found->setting : Setting::kNone;
}

}  // namespace scene

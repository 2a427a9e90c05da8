// The settings that the file makes on nodes, and which of them counts for an element of an attribute.
#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

#include "scene/Plug.h"

namespace scene {

// The setting of one setAttr: a value for the elements first to last, or for the whole attribute when both
// are kNoIndex.
struct Setting {
  static constexpr std::uint32_t kNone = 0xffffffff;

  std::string_view attribute;
  NodeId node;
  std::uint32_t value;
  std::uint32_t valueLength;
  std::int32_t first;
  std::int32_t last;
  std::uint32_t next = kNone;  // of the same node
};

// Finds the last setting of an element in logarithmic time, however many settings a node has and however
// their ranges overlap. Refers to settings by their indices in the vector that it was made from, and keeps no
// copy of them.
class SettingIndex {
 public:
  SettingIndex() = default;

  // Takes n log n steps for n settings. Every node of a setting is below nodeCount.
  SettingIndex(std::span<const Setting> settings, std::size_t nodeCount);

  // The index of the setting; Setting::kNone where nothing is set. `settings` are those it was made from.
  std::uint32_t Find(std::span<const Setting> settings, const Plug& plug) const;

 private:
  // Elements of one attribute that have the same last setting.
  struct Part {
    std::int32_t first;
    std::int32_t last;
    std::uint32_t setting;
  };

  void AddParts(std::span<const Setting> settings, std::span<const std::uint32_t> ofAttribute);

  std::vector<Part> parts_;             // by node, attribute and element; no two of them overlap
  std::vector<std::size_t> firstPart_;  // by node, and the end of all
};

}  // namespace scene

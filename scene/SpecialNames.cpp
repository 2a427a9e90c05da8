#include "scene/SpecialNames.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <string>

namespace scene {

bool IsStartupCamera(const Node& node) {
  constexpr std::array<std::string_view, 4> kNames = {"perspShape", "topShape", "frontShape", "sideShape"};
  return node.shared && std::find(kNames.begin(), kNames.end(), node.name) != kNames.end();
}

bool IsMarked(std::string_view name) {
  constexpr std::array<std::string_view, 3> kMarks = {"null", "NULL", "Null"};
  return std::any_of(kMarks.begin(), kMarks.end(),
                     [name](std::string_view mark) { return name.find(mark) != std::string_view::npos; });
}

std::string_view ImportName(const Scene& scene, const Node& node) {
  // With its quotes a name has fewer bytes than this.
  constexpr std::size_t kQuotedName = 255;
  const std::string_view text = scene.text();
  const auto [offset, length] = node.place;
  if (node.origin != Origin::Created || offset == 0 || offset + length >= text.size()) return {};
  if (text[offset - 1] != '"' || text[offset + length] != '"' || length + 2 >= kQuotedName) return {};
  return text.substr(offset, length);
}

bool CountsFrames(std::string_view timeUnit) {
  constexpr std::array<std::string_view, 6> kFrameUnits = {"film", "pal", "ntsc", "show", "palf", "ntscf"};
  if (!timeUnit.empty() && timeUnit.front() >= '0' && timeUnit.front() <= '9') return true;
  std::string lowered(timeUnit);
  for (char& c : lowered) c = c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
  return std::find(kFrameUnits.begin(), kFrameUnits.end(), lowered) != kFrameUnits.end();
}

}  // namespace scene

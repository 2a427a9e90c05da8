#include "scene/SpecialNames.h"

#include <algorithm>
#include <array>

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

}  // namespace scene

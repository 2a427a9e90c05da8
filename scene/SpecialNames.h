// Names with a special meaning for an import and for a bake.
#pragma once

#include <string_view>

#include "scene/Scene.h"

namespace scene {

// A camera that every scene begins with.
bool IsStartupCamera(const Node& node);

// Whether the importer makes a null of a locator of the name.
bool IsMarked(std::string_view name);

// The name by which the importer knows a node: as createNode has it, in quotes. Empty for any other node, and
// for one whose name is too long for the importer.
std::string_view ImportName(const Scene& scene, const Node& node);

// Whether the importer counts frames in a unit of time: the first key of each node then lands at time 0. In
// any other unit, such as "sec" or "game", keys keep their times.
bool CountsFrames(std::string_view timeUnit);

}  // namespace scene

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

}  // namespace scene

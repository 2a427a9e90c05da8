// The frame at which the keys of an import begin.
#pragma once

#include <optional>

#include "scene/Scene.h"

namespace bake {

// The smallest first key of the nodes that an import takes: the cameras, the marked locators, and the
// transforms above them. In frames of the scene; none where none of them has keys.
std::optional<double> FirstKeyOfImport(const scene::Scene& scene);

}  // namespace bake

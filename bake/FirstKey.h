// Where the keys of an import begin.
#pragma once

#include <optional>

#include "scene/Scene.h"

namespace bake {

// The smallest first key among what an import takes of the scene: its cameras, its marked locators, and the
// transforms above them. In frames of the scene; none where none of them has keys.
std::optional<double> FirstKeyOfImport(const scene::Scene& scene);

}  // namespace bake

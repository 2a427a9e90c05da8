// The cameras and locators of a scene that are written.
#pragma once

#include <cstddef>
#include <string_view>
#include <vector>

#include "bake/Options.h"
#include "diag/Collector.h"
#include "scene/Scene.h"

namespace bake {

// Shapes, in the order of the file.
struct Selection {
  std::vector<scene::NodeId> cameras;
  std::vector<scene::NodeId> locators;
  std::size_t locatorsLeftOut = 0;  // without a mark, where only marked ones are wanted
};

// Whether the node is a camera that an author set up: not an orthographic one, and not one that every scene
// begins with.
bool IsSetUp(const scene::Scene& scene, scene::NodeId id);

// The cameras that an author set up, and locators. Reports each name of the options that fits none of the
// cameras.
Selection Select(const scene::Scene& scene, const Options& options, diag::Collector* diagnostics);

}  // namespace bake

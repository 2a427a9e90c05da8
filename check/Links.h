// The transforms that a camera, its aim or a marked locator depends on.
#pragma once

#include <vector>

#include "check/Cameras.h"
#include "scene/Scene.h"

namespace check {

struct Link {
  scene::NodeId node = scene::kNoNode;   // a node that the file creates
  scene::NodeId shape = scene::kNoNode;  // the first camera or locator below it, in the order of the file
  bool own = false;                      // it is the transform of that shape
  bool ofCamera = false;                 // the shape is a camera
  bool target = false;                   // the camera looks at it; no more than its translation is taken
};

// The marked locators that the file creates, in its order.
std::vector<scene::NodeId> FindMarkedLocators(const scene::Scene& scene);

// Those of the cameras that the importer takes, of the locators, and what the cameras look at, each once:
// from the shape's own upwards, of a target itself alone.
std::vector<Link> FindLinks(const scene::Scene& scene, const std::vector<Camera>& cameras,
                            const std::vector<scene::NodeId>& locators);

}  // namespace check

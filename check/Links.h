// The transforms that a camera or a marked locator depends on.
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
};

// Those of the cameras and locators that the importer takes, each once: from the shape's own upwards.
std::vector<Link> FindLinks(const scene::Scene& scene, const std::vector<Camera>& cameras);

}  // namespace check

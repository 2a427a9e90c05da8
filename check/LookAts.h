// How look-ats are wired, as the importer finds it.
#pragma once

#include <string_view>
#include <vector>

#include "check/Cameras.h"
#include "scene/Scene.h"

namespace check {

struct LookAt {
  scene::NodeId node = scene::kNoNode;
  scene::NodeId turned = scene::kNoNode;  // kNoNode: it turns nothing
  const Camera* camera = nullptr;         // whose transform it turns; null: none
  scene::NodeId target = scene::kNoNode;  // at which the import aims the camera; kNoNode: it does not
};

// Those that the file creates: first those that turn cameras, then the others.
std::vector<LookAt> FindLookAts(const scene::Scene& scene, const std::vector<Camera>& cameras);

bool IsLookAt(std::string_view type);

// The connections into the look-at that the importer takes for its target, in the order of the file.
std::vector<const scene::Connection*> TargetsOf(const scene::Scene& scene, scene::NodeId lookAt);

}  // namespace check

// How look-ats are wired, as the importer finds it.
#pragma once

#include <string_view>
#include <vector>

#include "scene/Scene.h"

namespace check {

bool IsLookAt(std::string_view type);

// The connections into the look-at that the importer takes for its target, in the order of the file.
std::vector<const scene::Connection*> TargetsOf(const scene::Scene& scene, scene::NodeId lookAt);

}  // namespace check

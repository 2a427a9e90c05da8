// The paths of nodes, as comments and reports have them.
#pragma once

#include <string>

#include "scene/Scene.h"

namespace bake {

// "|rig|shotCam". Of a path longer than 1,000 bytes the end, after "...": a rig can be as deep as its file is
// long, and each of its cameras says its path.
std::string PathText(const scene::Scene& scene, scene::NodeId node);

}  // namespace bake

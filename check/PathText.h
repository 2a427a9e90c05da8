// The paths of nodes, as reports have them.
#pragma once

#include <string>

#include "scene/Scene.h"

namespace check {

// "|rig|shotCam". Of a path longer than 1,000 bytes the end, after "...": a chain can be as long as its file,
// and each of its cameras says its path. Time and memory do not grow with the length of the chain.
std::string PathText(const scene::Scene& scene, scene::NodeId node);

}  // namespace check

// Whether a transform is written in channels that the importer reads as they stand.
#pragma once

#include "scene/Scene.h"

namespace bake {

// True where translate, rotate and scale say all: XYZ order, no pivots, no rotate axis, no shear, no limits,
// no offset matrix, no joint orient, and nothing that drives one of these.
bool IsPlain(const scene::Scene& scene, scene::NodeId node);

// Whether the node takes over what stands above it, by the value that the scene holds, and whether that can
// change.
bool Inherits(const scene::Scene& scene, scene::NodeId node);
bool IsInheritanceDriven(const scene::Scene& scene, scene::NodeId node);

}  // namespace bake

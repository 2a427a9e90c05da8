// Whether the channels of a transform can be written unchanged.
#pragma once

#include "scene/Scene.h"

namespace bake {

// Whether translate, rotate and scale determine the matrix alone: XYZ order, no pivots, no rotate axis, no
// shear, no limits, no offset matrix, no joint orient, and nothing that drives one of these.
bool IsPlain(const scene::Scene& scene, scene::NodeId node);

// Whether the node inherits the transforms above it, by its stored value; and whether something drives that
// value.
bool Inherits(const scene::Scene& scene, scene::NodeId node);
bool IsInheritanceDriven(const scene::Scene& scene, scene::NodeId node);

}  // namespace bake

// Reads a curve's keys and tangents from a scene.
#pragma once

#include "motion/CurveData.h"
#include "motion/Measures.h"
#include "scene/Scene.h"

namespace motion {

// Values are in the scene's units, times in seconds; for a driven key "time" is the driving number. What
// cannot be read is left out.
CurveData ReadCurve(const scene::Scene& scene, scene::NodeId node, const Measures& measures);

}  // namespace motion

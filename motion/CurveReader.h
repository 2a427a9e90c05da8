// A curve's keys and tangents out of a scene.
#pragma once

#include "motion/CurveData.h"
#include "motion/Measures.h"
#include "scene/Scene.h"

namespace motion {

// Values in the scene's units, times in seconds; of a driven key "time" is the driving number. What cannot be
// read is left out.
CurveData ReadCurve(const scene::Scene& scene, scene::NodeId node, const Measures& measures);

}  // namespace motion

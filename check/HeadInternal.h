// The parts of the head.
#pragma once

#include <vector>

#include "check/Cameras.h"
#include "check/Head.h"
#include "diag/Collector.h"
#include "motion/Measures.h"
#include "scene/Settings.h"

namespace check {

Head ReadHead(const scene::Scene& scene, const scene::Settings& settings, const CameOver& cameOver,
              const std::vector<Camera>& cameras, diag::Lines& lines);

CameraHead DescribeCamera(const scene::Scene& scene, const scene::Settings& settings,
                          const CameOver& cameOver, const Camera& camera, diag::Lines& lines);

Where WhereIs(const diag::Range& range, diag::Lines& lines);

}  // namespace check

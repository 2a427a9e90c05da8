// The settings of a scene as a bake has them: units, rate, resolution.
#pragma once

#include <string>

#include "diag/Collector.h"
#include "motion/Camera.h"
#include "scene/Scene.h"

namespace bake {

struct Head {
  std::string linearUnit;      // as the scene says it
  std::string timeUnit;        // as the scene says it, but one that the importer takes for a rate
  double unitsPerFrame = 1.0;  // one frame of the bake in the scene's time unit
  motion::Picture picture;
};

// Reports a time unit that is no rate. Where the scene is silent the defaults of the program that wrote it
// hold.
Head ReadHead(const scene::Scene& scene, diag::Collector* diagnostics);

}  // namespace bake

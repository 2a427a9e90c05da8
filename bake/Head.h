// The settings of a scene as a bake has them: units, rate, resolution.
#pragma once

#include <optional>
#include <string>

#include "bake/Options.h"
#include "diag/Collector.h"
#include "motion/Camera.h"
#include "scene/Scene.h"

namespace bake {

struct Head {
  std::string linearUnit;      // as the scene says it
  std::string timeUnit;        // as the scene says it, but one that the importer takes for a rate
  double unitsPerFrame = 1.0;  // one frame of the bake in the scene's time unit
  motion::Picture picture;
  std::optional<FrameSpan> playback;  // what the scene plays, in frames of the bake
};

// Reports a time unit that is no rate, and values that cannot be read. Where the scene is silent the defaults
// of the version that wrote it hold.
Head ReadHead(const scene::Scene& scene, diag::Collector* diagnostics);

}  // namespace bake

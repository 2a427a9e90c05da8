// The settings of a bake, from those of its scene: units, rate, resolution.
#pragma once

#include <optional>
#include <string>

#include "bake/Options.h"
#include "diag/Collector.h"
#include "motion/Camera.h"
#include "scene/Scene.h"

namespace bake {

struct Head {
  std::string linearUnit;      // the scene's word
  std::string timeUnit;        // the scene's word, or another one that the importer takes for the same rate
  double unitsPerFrame = 1.0;  // one frame of the bake in the scene's time unit
  motion::Picture picture;
  std::optional<FrameSpan> playback;  // the scene's playback range, in frames of the bake
};

// Reports a time unit that is not a rate, and values that cannot be read. What the scene does not set has the
// defaults of the version that wrote it.
Head ReadHead(const scene::Scene& scene, diag::Collector* diagnostics);

}  // namespace bake

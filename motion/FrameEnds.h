// The first and the last frame of what a scene plays and keys.
#pragma once

#include <optional>
#include <span>

#include "motion/Measures.h"
#include "scene/Scene.h"

namespace motion {

// In frames, which are UnitsPerFrame of the scene's unit of time.
struct FrameEnds {
  double first = 1.0;
  double last = 1.0;
};

// Times nearer to a whole frame than this count as that frame.
inline constexpr double kFrameTolerance = 1e-6;

// What is played and all keys of the curves of time among the nodes, outward to whole frames. Nothing is
// played where the last frame lies before the first one. None where nothing is played or keyed.
std::optional<FrameEnds> FindFrameEnds(const scene::Scene& scene, const std::optional<FrameEnds>& played,
                                       std::span<const scene::NodeId> nodes, const Measures& measures);

}  // namespace motion

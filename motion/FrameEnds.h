// The first and the last frame of the playback range and the keys of a scene.
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

// The range of `played` and of all keys of time curves among the nodes, rounded outward to whole frames. A
// `played` whose last frame lies before its first one is ignored. None where there is neither.
std::optional<FrameEnds> FindFrameEnds(const scene::Scene& scene, const std::optional<FrameEnds>& played,
                                       std::span<const scene::NodeId> nodes, const Measures& measures);

}  // namespace motion

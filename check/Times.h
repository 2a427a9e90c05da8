// The times of the keys that a camera's picture depends on.
#pragma once

#include <cstddef>
#include <optional>

#include "check/RulesInternal.h"
#include "motion/FrameEnds.h"

namespace check {

// Of a longer chain, what stands further above is not looked at: many cameras may share it.
inline constexpr std::size_t kLongestChain = 64;

// Whether the scene's unit of time counts frames for the importer. The first key of a node then lands at time
// 0 of the composition.
bool CountsFrames(const scene::Scene& scene);

// The smallest first key of the camera and what stands above it, in the scene's unit. None where nothing is
// keyed.
std::optional<double> FirstKey(const Subject& subject, const Camera& camera);

// What the scene plays, in frames. None where it does not say.
std::optional<motion::FrameEnds> PlayedFrames(const scene::Scene& scene, const scene::Settings& settings);

}  // namespace check

// The frames that are baked.
#pragma once

#include <cstddef>
#include <optional>
#include <vector>

#include "bake/Head.h"
#include "bake/Options.h"
#include "diag/Collector.h"
#include "motion/Measures.h"
#include "scene/Scene.h"

namespace bake {

// The frames first, first + step, … in the scene's own numbers, which may be fractions.
struct FrameRange {
  double first = 1.0;
  double step = 1.0;
  std::size_t count = 1;

  double Frame(std::size_t index) const { return first + static_cast<double>(index) * step; }
  double Last() const { return Frame(count - 1); }
};

// The most frames of a bake without chosen frames.
inline constexpr std::size_t kMostFrames = 100'000;

// The range of the options; else the playback range and all keys of the curves among the nodes, rounded
// outward to whole frames; else frame 1. `nodes` are those that compute what is written. None after reporting
// an error: too many frames, or more than a composition's time can hold.
std::optional<FrameRange> FindFrames(const scene::Scene& scene, const std::vector<scene::NodeId>& nodes,
                                     const Options& options, const Head& head,
                                     const motion::Measures& measures, diag::Collector* diagnostics);

}  // namespace bake

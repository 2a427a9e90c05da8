#include "motion/FrameEnds.h"

#include <algorithm>
#include <cmath>

#include "motion/CurveReader.h"

namespace motion {
namespace {

void TakeIn(double frame, std::optional<FrameEnds>* ends) {
  if (!std::isfinite(frame)) return;
  if (!*ends) *ends = FrameEnds{frame, frame};
  (*ends)->first = std::min((*ends)->first, frame);
  (*ends)->last = std::max((*ends)->last, frame);
}

}  // namespace

std::optional<FrameEnds> FindFrameEnds(const scene::Scene& scene, const std::optional<FrameEnds>& played,
                                       std::span<const scene::NodeId> nodes, const Measures& measures) {
  std::optional<FrameEnds> ends;
  if (played && played->first <= played->last) {
    TakeIn(played->first, &ends);
    TakeIn(played->last, &ends);
  }
  const double unitsPerFrame = UnitsPerFrame(scene);
  for (const scene::NodeId node : nodes) {
    // Driven keys have no time.
    if (!scene.node(node).type.starts_with("animCurveT")) continue;
    for (const CurveKey& key : ReadCurve(scene, node, measures).keys) {
      TakeIn(key.time * measures.framesPerSecond / unitsPerFrame, &ends);
    }
  }
  if (!ends) return std::nullopt;
  return FrameEnds{std::floor(ends->first + kFrameTolerance), std::ceil(ends->last - kFrameTolerance)};
}

}  // namespace motion

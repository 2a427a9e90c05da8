#include "bake/FrameRange.h"

#include <algorithm>
#include <cmath>
#include <string>
#include <string_view>

#include "motion/CurveReader.h"
#include "text/Numbers.h"

namespace bake {
namespace {

using scene::NodeId;

// Times nearer to a whole frame than this count as that frame.
constexpr double kFrameTolerance = 1e-6;

// Later frames are no time that a composition could hold.
constexpr double kMostTimes = 2'000'000;

struct Ends {
  double first = INFINITY;
  double last = -INFINITY;

  bool known() const { return first <= last; }
  void TakeIn(double frame) {
    if (!std::isfinite(frame)) return;
    first = std::min(first, frame);
    last = std::max(last, frame);
  }
};

std::optional<FrameRange> RangeOf(double first, double last, double step, bool bounded,
                                  diag::Collector* diagnostics) {
  const double count = std::floor((last - first) / step + kFrameTolerance) + 1.0;
  const double most = bounded ? static_cast<double>(kMostFrames) : kMostTimes;
  if (!(count <= most) || !((count - 1.0) * step <= kMostTimes)) {
    diagnostics->Report(diag::Code::TooManyFrames, {},
                        {text::ShortestNumber(first), text::ShortestNumber(last)});
    return std::nullopt;
  }
  return FrameRange{first, step, static_cast<std::size_t>(count)};
}

}  // namespace

std::optional<FrameRange> FindFrames(const scene::Scene& scene, const std::vector<NodeId>& nodes,
                                     const Options& options, const Head& head,
                                     const motion::Measures& measures, diag::Collector* diagnostics) {
  if (options.frames) {
    return RangeOf(options.frames->first, options.frames->last, options.step, false, diagnostics);
  }
  Ends ends;
  if (head.playback) {
    ends.TakeIn(head.playback->first);
    ends.TakeIn(head.playback->last);
  }
  for (const NodeId node : nodes) {
    // Driven keys have no time.
    if (!scene.node(node).type.starts_with("animCurveT")) continue;
    for (const motion::CurveKey& key : motion::ReadCurve(scene, node, measures).keys) {
      ends.TakeIn(key.time * measures.framesPerSecond / head.unitsPerFrame);
    }
  }
  if (!ends.known()) return FrameRange{};
  return RangeOf(std::floor(ends.first + kFrameTolerance), std::ceil(ends.last - kFrameTolerance),
                 options.step, true, diagnostics);
}

}  // namespace bake

#include "bake/FrameRange.h"

#include <cmath>
#include <string>

#include "motion/FrameEnds.h"
#include "text/Numbers.h"

namespace bake {
namespace {

using scene::NodeId;

// The time of a composition can hold no more frames.
constexpr double kMostTimes = 2'000'000;

std::optional<FrameRange> RangeOf(double first, double last, double step, bool bounded,
                                  diag::Collector* diagnostics) {
  const double count = std::floor((last - first) / step + motion::kFrameTolerance) + 1.0;
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
  std::optional<motion::FrameEnds> played;
  if (head.playback) played = motion::FrameEnds{head.playback->first, head.playback->last};
  const auto ends = motion::FindFrameEnds(scene, played, nodes, measures);
  if (!ends) return FrameRange{};
  return RangeOf(ends->first, ends->last, options.step, true, diagnostics);
}

}  // namespace bake

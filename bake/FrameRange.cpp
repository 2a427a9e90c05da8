#include "bake/FrameRange.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <string>
#include <string_view>

#include "motion/CurveReader.h"

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

// The number that follows a word of a script, " -min 1".
std::optional<double> NumberAfter(std::string_view script, std::string_view option) {
  std::size_t at = script.find(option);
  if (at == std::string_view::npos) return std::nullopt;
  at = script.find_first_not_of(" \t", at + option.size());
  if (at == std::string_view::npos) return std::nullopt;
  return scene::NumberOf(script.substr(at, script.find_first_of(" \t;\n", at) - at));
}

// What the scene plays: it is written in a script.
void TakeInPlayback(const scene::Scene& scene, double unitsPerFrame, Ends* ends) {
  constexpr std::string_view kPlayback = "playbackOptions";
  for (NodeId id = 0; id < scene.nodes().size(); ++id) {
    if (scene.node(id).type != "script") continue;
    const auto before = scene.Written(id, "before");
    const auto script = before ? before->String() : std::nullopt;
    if (!script || script->find(kPlayback) == std::string::npos) continue;
    const auto least = NumberAfter(*script, "-min ");
    const auto most = NumberAfter(*script, "-max ");
    if (!least || !most || *least > *most) continue;
    ends->TakeIn(*least / unitsPerFrame);
    ends->TakeIn(*most / unitsPerFrame);
    return;
  }
}

// Finds the curves that move nodes, by way of whatever stands between.
class CurveSearch {
 public:
  explicit CurveSearch(const scene::Scene& scene) : scene_(scene), seen_(scene.nodes().size(), false) {}

  std::vector<NodeId> Run(const std::vector<NodeId>& nodes) {
    for (const NodeId node : nodes) Enter(node);
    while (!pending_.empty()) {
      const NodeId node = pending_.back();
      pending_.pop_back();
      for (const scene::Connection* connection : scene_.ConnectionsInto(node)) {
        const NodeId source = connection->source.node;
        Enter(source);
        // A matrix of a node depends on all that stands above it.
        for (NodeId above = scene_.node(source).parent; above != scene::kNoNode && !seen_[above];
             above = scene_.node(above).parent) {
          Enter(above);
        }
      }
    }
    return curves_;
  }

 private:
  void Enter(NodeId node) {
    if (seen_[node]) return;
    seen_[node] = true;
    pending_.push_back(node);
    if (scene_.node(node).type.starts_with("animCurveT")) curves_.push_back(node);
  }

  const scene::Scene& scene_;
  std::vector<bool> seen_;
  std::vector<NodeId> pending_;
  std::vector<NodeId> curves_;
};

std::string TextOf(double number) {
  char text[32];
  return {text, std::to_chars(text, text + sizeof text, number).ptr};
}

std::optional<FrameRange> RangeOf(double first, double last, double step, bool bounded,
                                  diag::Collector* diagnostics) {
  const double count = std::floor((last - first) / step + kFrameTolerance) + 1.0;
  const double most = bounded ? static_cast<double>(kMostFrames) : kMostTimes;
  if (!(count <= most) || !((count - 1.0) * step <= kMostTimes)) {
    diagnostics->Report(diag::Code::TooManyFrames, {}, {TextOf(first), TextOf(last)});
    return std::nullopt;
  }
  return FrameRange{first, step, static_cast<std::size_t>(count)};
}

}  // namespace

std::optional<FrameRange> FindFrames(const scene::Scene& scene, const std::vector<NodeId>& written,
                                     const Options& options, double unitsPerFrame,
                                     const motion::Measures& measures, diag::Collector* diagnostics) {
  if (options.frames) {
    return RangeOf(options.frames->first, options.frames->last, options.step, false, diagnostics);
  }
  Ends ends;
  TakeInPlayback(scene, unitsPerFrame, &ends);
  for (const NodeId curve : CurveSearch(scene).Run(written)) {
    for (const motion::CurveKey& key : motion::ReadCurve(scene, curve, measures).keys) {
      ends.TakeIn(key.time * measures.framesPerSecond / unitsPerFrame);
    }
  }
  if (!ends.known()) return FrameRange{};
  return RangeOf(std::floor(ends.first + kFrameTolerance), std::ceil(ends.last - kFrameTolerance),
                 options.step, true, diagnostics);
}

}  // namespace bake

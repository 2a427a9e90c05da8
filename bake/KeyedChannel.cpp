#include "bake/KeyedChannel.h"

#include <algorithm>
#include <cmath>

#include "diag/ShownText.h"
#include "motion/Curve.h"
#include "motion/CurveReader.h"

namespace bake {
namespace {

constexpr std::size_t kLongestShown = 100;

// Relative to the larger of the values of two keys and their difference. As exact as bakes are tested to be
// where handles were moved.
constexpr double kTolerance = 1e-5;

}  // namespace

std::optional<KeyedChannel> FindKeys(const scene::Scene& scene, scene::NodeId node,
                                     std::string_view attribute, const motion::Measures& measures) {
  const auto driver = scene.SourceOf(scene.PlugOf(node, attribute));
  if (!driver) return std::nullopt;
  const scene::NodeId curve = driver->plug.node;
  const std::string_view type = scene.node(curve).type;
  if (type != "animCurveTL" && type != "animCurveTA" && type != "animCurveTU") return std::nullopt;
  if (scene.SourceOf(scene.PlugOf(curve, "input"))) return std::nullopt;
  KeyedChannel channel{attribute, curve, motion::ReadCurve(scene, curve, measures)};
  if (channel.curve.keys.empty()) return std::nullopt;
  return channel;
}

bool IsCurvedBetweenFrames(const motion::CurveData& data, double framesPerSecond) {
  const motion::Curve curve(data);
  const std::vector<motion::CurveKey>& keys = curve.Data().keys;
  motion::CurveCursor cursor;
  for (std::size_t right = 1; right < keys.size(); ++right) {
    const motion::CurveKey& a = keys[right - 1];
    const motion::CurveKey& b = keys[right];
    constexpr double kOneFrame = 1.0 + 1e-6;
    if ((b.time - a.time) * framesPerSecond <= kOneFrame) continue;
    const double size = std::max({std::fabs(a.value), std::fabs(b.value), std::fabs(b.value - a.value)});
    for (const double part : {0.25, 0.5, 0.75}) {
      const double straight = a.value + part * (b.value - a.value);
      const double value = curve.At(a.time + part * (b.time - a.time), &cursor);
      if (std::fabs(value - straight) > kTolerance * size) return true;
    }
  }
  return false;
}

std::string ShownNode(const scene::Scene& scene, scene::NodeId node) {
  const std::string_view name = scene.node(node).name;
  std::string shown = diag::ShownText(name.substr(0, kLongestShown));
  if (name.size() > kLongestShown) shown += "...";
  return '"' + shown + '"';
}

}  // namespace bake

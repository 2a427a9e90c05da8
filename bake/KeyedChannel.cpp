#include "bake/KeyedChannel.h"

#include "diag/ShownText.h"
#include "motion/CurveReader.h"

namespace bake {
namespace {

constexpr std::size_t kLongestShown = 100;

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

std::string ShownNode(const scene::Scene& scene, scene::NodeId node) {
  const std::string_view name = scene.node(node).name;
  std::string shown = diag::ShownText(name.substr(0, kLongestShown));
  if (name.size() > kLongestShown) shown += "...";
  return '"' + shown + '"';
}

}  // namespace bake

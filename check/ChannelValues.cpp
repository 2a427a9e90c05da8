// Values of channels that come over, but not as the scene means them: angles in radians, and what lies beyond
// a limit.
#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <functional>
#include <numbers>
#include <optional>
#include <string>

#include "check/Curves.h"
#include "check/RulesInternal.h"
#include "check/SetCommands.h"
#include "motion/CurveReader.h"
#include "scene/Attributes.h"
#include "text/Numbers.h"

namespace check {
namespace {

using diag::Code;
using scene::NodeId;

constexpr double kSameNumber = 1e-9;

struct Found {
  double value = 0.0;
  diag::Range place;
};

// Whether to look at a stored value that the import does not have: it has another one in its place.
enum class Skipped { No, Yes };

// The first value of the channel that the import takes and that `wanted` holds for: a key, or what is stored.
std::optional<Found> FirstValue(const Subject& subject, NodeId node, std::string_view channel,
                                Skipped skipped, const std::function<bool(double)>& wanted) {
  const scene::Scene& scene = subject.scene;
  if (!scene.SourceOf(scene.PlugOf(node, channel))) {
    const auto written = scene.Written(node, channel);
    const auto stored = written ? written->Number() : std::nullopt;
    const auto imported = stored ? ImportedNumber(scene, node, channel) : std::nullopt;
    const bool asStored = imported && std::fabs(*imported - *stored) <= kSameNumber * std::fabs(*stored);
    if (!imported || (!asStored && skipped == Skipped::No)) return std::nullopt;
    if (wanted(*imported)) return Found{*imported, written->range()};
    return std::nullopt;
  }
  const std::span<const KeyedChannel> keyed = subject.channels.KeyedOf(node);
  const bool animated =
      std::any_of(keyed.begin(), keyed.end(), [](const KeyedChannel& one) { return one.keys > 1; });
  const auto own = std::find_if(keyed.begin(), keyed.end(),
                                [channel](const KeyedChannel& one) { return one.channel == channel; });
  if (!animated || own == keyed.end()) return std::nullopt;  // other rules say what comes over
  for (const motion::CurveKey& key : motion::ReadCurve(scene, own->curve, subject.measures).keys) {
    if (wanted(key.value)) return Found{key.value, own->place};
  }
  return std::nullopt;
}

// To three digits: what is left of an angle is small.
std::string Roughly(double number) {
  constexpr int kDigits = 3;
  std::array<char, 32> digits{};
  const auto end = std::to_chars(digits.data(), digits.data() + digits.size(), number,
                                 std::chars_format::general, kDigits);
  return {digits.data(), end.ptr};
}

void ReportRadiansOf(const Subject& subject, NodeId node) {
  for (const std::string_view channel : scene::kPlaceChannels) {
    if (!channel.starts_with("rotate")) continue;
    const auto angle = FirstValue(subject, node, channel, Skipped::Yes,
                                  [](double value) { return std::fabs(value) > kSameNumber; });
    if (!angle) continue;
    return subject.diagnostics.Report(
        Code::RadiansLost, angle->place,
        {subject.scene.node(node).name, channel, text::ShortestNumber(angle->value),
         Roughly(angle->value * std::numbers::pi / 180.0)});
  }
}

// "translateX" and "max": "maxTransXLimit".
std::string NameOfLimit(std::string_view bound, std::string_view channel) {
  const std::string_view what = channel.substr(0, channel.size() - 1);
  const std::string_view word = what == "translate" ? "Trans" : what == "rotate" ? "Rot" : "Scale";
  return std::string(bound).append(word).append(channel.substr(channel.size() - 1)).append("Limit");
}

void ReportLimit(const Subject& subject, NodeId node, std::string_view bound, std::string_view channel) {
  const scene::Scene& scene = subject.scene;
  const std::string name = NameOfLimit(bound, channel);
  const auto enabled = scene.Written(node, name + "Enable");
  if (!enabled || !enabled->IsOn()) return;
  const auto limit = scene.Number(node, name);
  if (!limit) return;
  const bool least = bound == "min";
  const auto beyond = FirstValue(subject, node, channel, Skipped::No, [&](double value) {
    return (least ? *limit - value : value - *limit) > kSameNumber * std::max(1.0, std::fabs(*limit));
  });
  if (!beyond) return;
  const auto written = scene.Written(node, name);
  subject.diagnostics.Report(
      Code::LimitLost, written ? written->range() : enabled->range(),
      {scene.node(node).name, channel, text::ShortestNumber(beyond->value), text::ShortestNumber(*limit)});
}

bool HasLimits(const scene::Scene& scene, NodeId node) {
  bool found = false;
  scene.ForEachTouched(node, [&found](std::string_view attribute) {
    found |= attribute.find("LimitEnable") != std::string_view::npos;
  });
  return found;
}

}  // namespace

void ReportChannelValues(const Subject& subject) {
  const bool radians = subject.measures.radians == 1.0;
  for (const Link& link : subject.links) {
    if (radians && !link.target) ReportRadiansOf(subject, link.node);
    if (!HasLimits(subject.scene, link.node)) continue;
    for (const std::string_view channel : scene::kPlaceChannels) {
      if (link.target && !channel.starts_with("translate")) continue;
      for (const std::string_view bound : {"min", "max"}) ReportLimit(subject, link.node, bound, channel);
    }
  }
}

}  // namespace check

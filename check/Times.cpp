// Keys, and where they land in time.
#include <algorithm>
#include <array>
#include <cmath>
#include <optional>
#include <span>
#include <string>
#include <vector>

#include "check/Curves.h"
#include "check/RulesInternal.h"
#include "check/Times.h"
#include "motion/CurveReader.h"
#include "scene/Attributes.h"
#include "scene/SpecialNames.h"
#include "text/Numbers.h"

namespace check {
namespace {

using diag::Code;
using scene::NodeId;

// A time of a composition is a thousand times the frame, in 31 bits.
constexpr double kLastFrame = 2147483.647;

// The keys of one node as the importer takes them.
struct NodeKeys {
  NodeId node = scene::kNoNode;
  std::span<const KeyedChannel> channels;
  double first = 0.0;  // what its time begins with
};

std::optional<NodeKeys> KeysOf(NodeId node, std::span<const KeyedChannel> channels, std::size_t fewest) {
  NodeKeys keys{node, channels, 0.0};
  const auto animated = [fewest](const KeyedChannel& channel) { return channel.keys >= fewest; };
  if (std::none_of(keys.channels.begin(), keys.channels.end(), animated)) return std::nullopt;
  const auto source = std::find_if(keys.channels.begin(), keys.channels.end(),
                                   [](const KeyedChannel& channel) { return channel.keys != 0; });
  keys.first = source->first;
  return keys;
}

bool SameTimes(const Subject& subject, const KeyedChannel& a, const KeyedChannel& b) {
  if (a.curve == b.curve) return true;
  if (std::fabs(a.first - b.first) > 1e-3 || std::fabs(a.last - b.last) > 1e-3) return false;
  if (a.whole && b.whole) return true;
  const auto keysOf = [&](const KeyedChannel& channel) {
    return motion::ReadCurve(subject.scene, channel.curve, subject.measures).keys;
  };
  const std::vector<motion::CurveKey> one = keysOf(a);
  const std::vector<motion::CurveKey> other = keysOf(b);
  return std::equal(
      one.begin(), one.end(), other.begin(), other.end(),
      [](const motion::CurveKey& x, const motion::CurveKey& y) { return std::fabs(x.time - y.time) < 1e-6; });
}

// The channel whose keys the import puts at the times of another channel. A node has one list of times: that
// of its first channel of several keys. Its first key is that of the first channel with any. Null: none.
const KeyedChannel* TakesOtherTimes(const Subject& subject, const NodeKeys& keys) {
  const KeyedChannel* lead = nullptr;
  for (const KeyedChannel& channel : keys.channels) {
    if (channel.keys < 2) continue;
    if (lead == nullptr) {
      lead = &channel;
      if (std::fabs(channel.first - keys.first) > 1e-3) return &channel;
    } else if (channel.keys == lead->keys && !SameTimes(subject, *lead, channel)) {
      return &channel;
    }
  }
  return nullptr;
}

void ReportKeys(const Subject& subject, const NodeKeys& keys) {
  const std::string_view name = subject.scene.node(keys.node).name;
  const double unit = motion::UnitsPerFrame(subject.scene);
  const auto say = [&](Code code, const KeyedChannel& channel, double number) {
    subject.diagnostics.Report(code, channel.place, {name, text::RoundedNumber(number)});
  };
  const auto first = [&](const auto& holds) {
    const auto found = std::find_if(keys.channels.begin(), keys.channels.end(), holds);
    return found == keys.channels.end() ? nullptr : &*found;
  };
  const KeyedChannel* bad = first([&](const KeyedChannel& channel) {
    const bool turns = channel.channel.starts_with("rotate");
    return channel.keys > 1 && !channel.whole &&
           (subject.shapes.IsCurved(channel.curve) || (turns && subject.shapes.TurnsFar(channel.curve)));
  });
  if (bad == nullptr) bad = TakesOtherTimes(subject, keys);
  if (bad != nullptr) {
    const double frames = std::ceil(bad->last / unit - 1e-6) - std::floor(bad->first / unit + 1e-6) + 1.0;
    subject.diagnostics.Report(Code::KeysAreNoBake, bad->place,
                               {name, std::to_string(bad->keys), text::RoundedNumber(frames)});
  }
  bad = first([](const KeyedChannel& one) { return one.keys != 0 && one.first < 0.0; });
  if (bad != nullptr) say(Code::NegativeFrames, *bad, bad->first / unit);
  bad = first([](const KeyedChannel& one) { return one.fractional; });
  if (bad != nullptr) say(Code::FractionalFrames, *bad, bad->fraction);
  bad = first([](const KeyedChannel& one) { return one.keys != 0 && one.last - one.first > kLastFrame; });
  if (bad != nullptr) say(Code::BeyondCompositionTime, *bad, bad->last);
}

// The keys of the lens and of the nodes above the shape. `whole`: also of those that do not come over.
std::vector<NodeKeys> ChainKeys(const Subject& subject, const Camera& camera, bool whole) {
  std::vector<NodeKeys> chain;
  if (auto lens = KeysOf(camera.shape, subject.channels.LensOf(camera.shape), 1)) chain.push_back(*lens);
  std::size_t length = 0;
  NodeId id = camera.shape;
  while (whole || ParentLossOf(subject.scene, subject.scene.node(id)) == ParentLoss::None) {
    id = subject.scene.node(id).parent;
    if (id == scene::kNoNode || ++length > kLongestChain) break;
    if (auto keys = KeysOf(id, subject.channels.KeyedOf(id), 2)) chain.push_back(*keys);
  }
  return chain;
}

const NodeKeys* Earliest(const std::vector<NodeKeys>& chain) {
  const auto earliest = std::min_element(
      chain.begin(), chain.end(), [](const NodeKeys& a, const NodeKeys& b) { return a.first < b.first; });
  return earliest == chain.end() ? nullptr : &*earliest;
}

void ReportStart(const Subject& subject, const NodeKeys& one, const NodeKeys& other) {
  if (std::fabs(one.first - other.first) < 1e-3) return;
  subject.diagnostics.Report(Code::KeysStartApart, one.channels.front().place,
                             {subject.scene.node(one.node).name, text::RoundedNumber(one.first),
                              subject.scene.node(other.node).name, text::RoundedNumber(other.first)});
}

// Reports the nodes whose first key differs from the one that they are compared with. A node above a camera
// is compared with the earliest of its chain. Nodes above locators, and targets, are compared with the first
// camera that is keyed; without one with the first of themselves.
void ReportStarts(const Subject& subject) {
  std::optional<NodeKeys> lead;
  for (const Camera& camera : subject.cameras) {
    if (!camera.taken) continue;
    const std::vector<NodeKeys> chain = ChainKeys(subject, camera, false);
    const NodeKeys* const earliest = Earliest(chain);
    if (earliest == nullptr) continue;
    for (const NodeKeys& one : chain) ReportStart(subject, one, *earliest);
    if (!lead) lead = *earliest;
  }
  for (const Link& link : subject.links) {
    if (link.ofCamera) continue;
    const auto keys = KeysOf(link.node, KeyedOf(subject, link), 2);
    if (!keys) continue;
    if (!lead) lead = *keys;
    ReportStart(subject, *keys, *lead);
  }
}

}  // namespace

std::optional<motion::FrameEnds> PlayedFrames(const scene::Scene& scene, const scene::Settings& settings) {
  if (!settings.playback) return std::nullopt;
  const double unitsPerFrame = motion::UnitsPerFrame(scene);
  const auto& played = settings.playback->value;
  return motion::FrameEnds{played.first / unitsPerFrame, played.last / unitsPerFrame};
}

bool CountsFrames(const scene::Scene& scene) { return scene::CountsFrames(scene.timeUnit().word); }

std::optional<double> FirstKey(const Subject& subject, const Camera& camera) {
  std::optional<double> first;
  for (const NodeKeys& keys : ChainKeys(subject, camera, true))
    first = std::min(first.value_or(keys.first), keys.first);
  return first;
}

void ReportTimes(const Subject& subject) {
  for (const Link& link : subject.links) {
    if (const auto keys = KeysOf(link.node, KeyedOf(subject, link), 2)) ReportKeys(subject, *keys);
  }
  for (const Camera& camera : subject.cameras) {
    if (!camera.taken) continue;
    if (const auto keys = KeysOf(camera.shape, subject.channels.LensOf(camera.shape), 1))
      ReportKeys(subject, *keys);
  }
  if (CountsFrames(subject.scene)) ReportStarts(subject);
}

}  // namespace check

#include "tests/check/ValueContradictions.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <numbers>
#include <optional>
#include <span>

#include "motion/CurveReader.h"
#include "motion/FrameEnds.h"

namespace check_test {
namespace {

using check::CameOverLayer;
using check::CameOverStream;
using diag::Code;
using motion::Matrix;
using motion::Vector;
using scene::NodeId;

constexpr std::array<std::string_view, 9> kPlace = {
    "translateX", "translateY", "translateZ", "rotateX", "rotateY", "rotateZ", "scaleX", "scaleY", "scaleZ"};

// The times of a node's keys, as its curves have them: seconds.
struct Keys {
  bool driven = false;         // by a curve, of one key or more
  std::vector<NodeId> curves;  // all that drive it
  std::vector<double> times;   // of the first curve of several keys; empty where there is none
  bool together = true;        // the other curves of several keys have theirs at the same times
  double first = 0.0;          // of the first curve
};

Keys KeysOf(const Author& author, NodeId node, std::span<const std::string_view> channels) {
  Keys found;
  for (const std::string_view channel : channels) {
    const auto driver = author.scene.SourceOf(author.scene.PlugOf(node, channel));
    if (!driver || !author.scene.node(driver->plug.node).type.starts_with("animCurveT")) continue;
    if (author.scene.node(driver->plug.node).type == "animCurveTT") continue;
    found.curves.push_back(driver->plug.node);
    const auto keys = motion::ReadCurve(author.scene, driver->plug.node, author.measures).keys;
    if (keys.empty()) continue;
    if (!found.driven) found.first = keys.front().time;
    found.driven = true;
    if (keys.size() < 2) continue;
    if (found.times.empty()) {
      for (const motion::CurveKey& key : keys) found.times.push_back(key.time);
    } else {
      found.together &= std::equal(
          keys.begin(), keys.end(), found.times.begin(), found.times.end(),
          [](const motion::CurveKey& key, double time) { return std::fabs(key.time - time) < 1e-6; });
    }
  }
  return found;
}

// Seconds of the scene at time 0 of the node's layer.
double StartOf(const Author& author, const Keys& keys) { return author.CountsFrames() ? keys.first : 0.0; }

double At(const CameOverStream& stream, std::size_t key, std::size_t component, std::size_t components) {
  return stream.times.empty() ? stream.value[component] : stream.values[key * components + component];
}

// The layer's place at one of its keys, in the scene's axes: Y and Z of a composition point the other way.
Matrix PlaceOf(const CameOverLayer& layer, std::size_t key) {
  constexpr double kDegree = std::numbers::pi / 180.0;
  const double x = At(layer.rotateX, key, 0, 1) * kDegree;
  const double y = -At(layer.rotateY, key, 0, 1) * kDegree;
  const double z = -At(layer.rotateZ, key, 0, 1) * kDegree;
  const double cx = std::cos(x), sx = std::sin(x), cy = std::cos(y), sy = std::sin(y), cz = std::cos(z),
               sz = std::sin(z);
  Matrix place;
  place.x = Vector{cy * cz, cy * sz, -sy} * (At(layer.scale, key, 0, 3) / 100.0);
  place.y =
      Vector{sx * sy * cz - cx * sz, sx * sy * sz + cx * cz, sx * cy} * (At(layer.scale, key, 1, 3) / 100.0);
  place.z =
      Vector{cx * sy * cz + sx * sz, cx * sy * sz - sx * cz, cx * cy} * (At(layer.scale, key, 2, 3) / 100.0);
  place.origin = {At(layer.position, key, 0, 3), -At(layer.position, key, 1, 3),
                  -At(layer.position, key, 2, 3)};
  return place;
}

bool Same(const Vector& a, const Vector& b) { return Length(a - b) <= 1e-6 * (1.0 + Length(a) + Length(b)); }

// The seconds at which a node is looked at: its keys, or the frames of what moves it in another way.
std::vector<double> TimesToLookAt(const Author& author, const Keys& keys,
                                  const motion::Evaluator& evaluator) {
  std::vector<double> times = keys.times;
  if (!times.empty()) return times;
  const auto ends =
      motion::FindFrameEnds(author.scene, std::nullopt, evaluator.computingNodes(), author.measures)
          .value_or(motion::FrameEnds{});
  constexpr int kSamples = 8;
  const double second = motion::UnitsPerFrame(author.scene) / author.measures.framesPerSecond;
  for (int i = 0; i <= kSamples; ++i)
    times.push_back((ends.first + (ends.last - ends.first) * i / kSamples) * second);
  return times;
}

// How the keys of a stream differ from those that the curves of the node ask for.
std::string KeysDiffer(const Author& author, const check::Report& report, const CameOverStream& stream,
                       const Keys& keys) {
  if (stream.times.size() != keys.times.size()) {
    return std::to_string(keys.times.size()) + " keys, " + std::to_string(stream.times.size()) + " came over";
  }
  if (!keys.together) return "curves with keys at different times";
  const double resolution = 1.001e-3 / author.measures.framesPerSecond;
  const double start = StartOf(author, keys);
  const bool rateIsSaid =
      std::any_of(report.findings.begin(), report.findings.end(),
                  [](const check::Finding& finding) { return finding.diagnostic.code == Code::RateDiffers; });
  for (std::size_t i = 0; i < keys.times.size(); ++i) {
    if (std::fabs(stream.times[i] - (keys.times[i] - start)) > resolution && !rateIsSaid)
      return "key " + std::to_string(i) + " at " + std::to_string(keys.times[i] - start) +
             " s came over at " + std::to_string(stream.times[i]) + " s";
  }
  return "";
}

std::string Unexplained(const Author& author, NodeId node, std::string_view channel,
                        const std::string& what) {
  return author.scene.PathOf(node) + ", " + std::string(channel) + ": " + what + ", and nothing is said";
}

std::string PlaceContradiction(const Author& author, const check::Report& report, const Layered& layered,
                               Compared* compared) {
  const auto& [shape, node, layer] = layered;
  const Keys keys = KeysOf(author, node, kPlace);
  std::vector<NodeId> named = keys.curves;
  named.push_back(node);
  const bool lost = IsSaidOf(author, report, named,
                             {Code::ConnectionToPath, Code::SameNames, Code::NamesDifferInCase,
                              Code::NameTaken, Code::AlreadyConnected, Code::BeyondCompositionTime});
  if (lost) return "";
  struct Channel {
    std::string_view name;
    const CameOverStream& stream;
  };
  for (const Channel& channel :
       {Channel{"position", layer.position}, Channel{"rotation about X", layer.rotateX},
        Channel{"rotation about Y", layer.rotateY}, Channel{"rotation about Z", layer.rotateZ},
        Channel{"scale", layer.scale}}) {
    ++compared->channels;
    compared->keys += channel.stream.times.size();
    const std::string differ = KeysDiffer(author, report, channel.stream, keys);
    if (!differ.empty() && !IsSaidOf(author, report, {node}, {Code::KeysAreNoBake, Code::KeysAtOneTime}))
      return Unexplained(author, node, channel.name, differ);
  }
  if (!keys.together) return "";
  const bool driven = IsSaidOf(author, report, {node},
                               {Code::DrivenByNoCurve, Code::CurveThroughNode, Code::ChannelsOfOneKey});
  if (driven) return "";
  // About a pivot, another rotation is another position too.
  const bool turned =
      IsSaidOf(author, report, {node, shape},
               {Code::RadiansLost, Code::RotateOrderLost, Code::RotateAxisLost, Code::ShearLost,
                Code::StoredValueSkipped, Code::OffsetMatrixLost, Code::LimitLost, Code::KeysAtOneTime,
                Code::LookAtShortNames, Code::LookAtNotTaken, Code::LookAtWeightLast});
  const bool moved =
      turned || IsSaidOf(author, report, {node}, {Code::PivotTranslationLost, Code::AimedPivotLost});
  diag::Collector unreported(author.text);
  motion::Evaluator evaluator(author.scene, &unreported);
  const motion::MatrixId place = evaluator.InParent(node);
  evaluator.MoveTo(0.0);
  const std::vector<double> times = TimesToLookAt(author, keys, evaluator);
  for (std::size_t i = 0; i < times.size(); ++i) {
    evaluator.MoveTo(times[i] * author.measures.framesPerSecond);
    const Matrix meant = evaluator.Value(place);
    const Matrix came = PlaceOf(layer, i);
    const std::string when = " at " + std::to_string(times[i]) + " s";
    if (!moved && !Same(meant.origin, came.origin))
      return Unexplained(author, node, "position", "differs" + when);
    for (int axis = 0; axis < 3 && !turned && !layer.aimed; ++axis) {
      if (!Same(meant.Axis(axis), came.Axis(axis)))
        return Unexplained(author, node, "rotation or scale", "differs" + when);
    }
  }
  return "";
}

}  // namespace

std::string ValueContradiction(const Author& author, const check::Report& report, const Layered& layered,
                               Compared* compared) {
  return PlaceContradiction(author, report, layered, compared);
}

std::string InterestContradiction(const Author& author, const check::Report& report, const Layered& layered,
                                  Compared* compared) {
  const auto& [shape, lookAt, layer] = layered;
  // The target is connected as a whole or by its components.
  NodeId target = scene::kNoNode;
  for (const scene::Connection* const connection : author.scene.ConnectionsInto(lookAt)) {
    if (connection->destination.attribute.starts_with("targetTranslate")) target = connection->source.node;
  }
  ++compared->channels;
  if (target == scene::kNoNode) return Unexplained(author, lookAt, "interest", "has no target");
  if (IsSaidOf(author, report, {target, lookAt},
               {Code::DrivenByNoCurve, Code::CurveThroughNode, Code::SameNames, Code::NamesDifferInCase,
                Code::ConnectionToPath, Code::ChannelsOfOneKey})) {
    return "";
  }
  const Keys keys = KeysOf(author, target, kPlace);
  compared->keys += layer.interest.times.size();
  const std::string differ = KeysDiffer(author, report, layer.interest, keys);
  if (!differ.empty() && !IsSaidOf(author, report, {target}, {Code::KeysAreNoBake}))
    return Unexplained(author, target, "interest", differ);
  if (!keys.together) return "";
  diag::Collector unreported(author.text);
  motion::Evaluator evaluator(author.scene, &unreported);
  const motion::NumberId axes[] = {evaluator.Number(target, "translateX"),
                                   evaluator.Number(target, "translateY"),
                                   evaluator.Number(target, "translateZ")};
  evaluator.MoveTo(0.0);
  const std::vector<double> times = TimesToLookAt(author, keys, evaluator);
  for (std::size_t i = 0; i < times.size(); ++i) {
    evaluator.MoveTo(times[i] * author.measures.framesPerSecond);
    const Vector meant{evaluator.Value(axes[0]), evaluator.Value(axes[1]), evaluator.Value(axes[2])};
    const Vector came{At(layer.interest, i, 0, 3), -At(layer.interest, i, 1, 3),
                      -At(layer.interest, i, 2, 3)};
    if (!Same(meant, came))
      return Unexplained(author, target, "interest", "differs at " + std::to_string(times[i]) + " s");
  }
  return "";
}

std::string StartContradiction(const Author& author, const check::Report& report, NodeId shape,
                               const std::vector<NodeId>& places) {
  if (!author.CountsFrames()) return "";
  std::optional<double> start;
  for (const NodeId node : places) {
    const Keys keys = KeysOf(author, node, kPlace);
    if (keys.times.empty()) continue;
    const double apart = std::fabs(keys.first - start.value_or(keys.first)) * author.measures.framesPerSecond;
    if (apart > 2e-3 && !IsSaidOf(author, report, places, {Code::KeysStartApart}))
      return Unexplained(author, shape, "start", "the nodes above it are keyed from different times");
    start = keys.first;
  }
  return "";
}

}  // namespace check_test

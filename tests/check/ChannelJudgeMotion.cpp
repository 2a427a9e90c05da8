// Places: their keys, and the values at them.
#include <algorithm>
#include <array>
#include <cmath>
#include <limits>
#include <numbers>

#include "tests/check/ChannelJudge.h"

namespace check_test {
namespace {

using check::CameOverLayer;
using check::CameOverStream;
using diag::Code;

struct Channel {
  const char* name;
  const char* longName;
  double neutral;
};

constexpr std::array<Channel, 9> kChannels = {{{"tx", "translateX", 0.0},
                                               {"ty", "translateY", 0.0},
                                               {"tz", "translateZ", 0.0},
                                               {"rx", "rotateX", 0.0},
                                               {"ry", "rotateY", 0.0},
                                               {"rz", "rotateZ", 0.0},
                                               {"sx", "scaleX", 1.0},
                                               {"sy", "scaleY", 1.0},
                                               {"sz", "scaleZ", 1.0}}};

// The import writes its times in thousandths of a frame.
constexpr double kSameFrame = 1.001e-3;

// The import multiplies angles in radians by this; the author means its inverse.
constexpr double kRadian = std::numbers::pi / 180.0;

bool IsCurve(const PlainNode& node) {
  return node.type == "animCurveTL" || node.type == "animCurveTA" || node.type == "animCurveTU";
}

// Where a layer stands, in the scene's space: Y and Z of a composition point the other way.
PlainPlace PlaceOf(const CameOverLayer& layer, std::optional<std::size_t> key) {
  const Triple position = StreamAt(layer.position, key, 3);
  const Triple scale = StreamAt(layer.scale, key, 3);
  return Moved({position[0], -position[1], -position[2]}) *
         TurnedAbout(2, -StreamAt(layer.rotateZ, key, 1)[0]) *
         TurnedAbout(1, -StreamAt(layer.rotateY, key, 1)[0]) *
         TurnedAbout(0, StreamAt(layer.rotateX, key, 1)[0]) *
         Scaled({scale[0] / 100.0, scale[1] / 100.0, scale[2] / 100.0});
}

}  // namespace

// A node has one list of times for all of its channels, and begins with the first key of its first curve.
bool ChannelJudge::AreTogether(const std::vector<Source>& channels, const std::vector<double>& times) {
  if (times.empty()) return true;
  const auto first = std::find_if(channels.begin(), channels.end(),
                                  [](const Source& channel) { return channel.keys() != 0; });
  if (std::fabs(first->time(0) - times[0]) > kSameFrame) return false;
  return std::all_of(channels.begin(), channels.end(), [&times](const Source& channel) {
    for (std::size_t key = 0; channel.keys() > 1 && key < times.size(); ++key) {
      if (std::fabs(channel.time(key) - times[key]) > 1e-9) return false;
    }
    return true;
  });
}

ChannelJudge::Source ChannelJudge::SourceOf(int node, const std::string& attribute, double neutral) const {
  Source source{scene_.Number(node, attribute, neutral)};
  const PlainDriver* const driver = scene_.DriverOf(node, attribute);
  if (driver == nullptr || driver->node == kNone || !IsCurve(scene_.node(driver->node))) return source;
  if (!SaysAt({Code::ConnectionToPath}, driver->text)) source.curve = &scene_.node(driver->node);
  return source;
}

// Empty where all that drives the node comes over, or is said not to.
std::string ChannelJudge::ReadMotion(int node, int shape, bool aimed, Motion* motion) const {
  const PlainNode& one = scene_.node(node);
  for (const Channel& channel : kChannels) {
    const Source source = SourceOf(node, channel.name, channel.neutral);
    motion->channels.push_back(source);
    if (source.keys() > 1 && motion->keys == 0) {
      motion->keys = source.keys();
      for (std::size_t key = 0; key < source.keys(); ++key) motion->times.push_back(source.time(key));
    }
    const PlainDriver* const driver = scene_.DriverOf(node, channel.name);
    if (driver == nullptr || source.curve != nullptr) continue;
    if (shape == kNone && channel.name[0] != 't') continue;
    if (SaysAt({Code::ConnectionToPath}, driver->text)) continue;
    const std::string by = driver->node == kNone ? driver->sourcePlug.substr(0, driver->sourcePlug.find('.'))
                                                 : scene_.node(driver->node).name;
    const bool ownLookAt = shape != kNone && scene_.node(shape).parent == node && driver->node != kNone &&
                           IsLookAt(scene_.node(driver->node)) && channel.name[0] == 'r';
    if (ownLookAt &&
        (aimed || SaysWith({Code::LookAtShortNames, Code::LookAtNotTaken}, {by, scene_.node(shape).name})))
      continue;
    if (!SaysOfChannel(node, channel.longName, by))
      return "nothing is said of " + by + ", which drives " + one.name + '.' + channel.name;
  }
  motion->together = AreTogether(motion->channels, motion->times);
  return "";
}

std::string ChannelJudge::JudgeMotion(int node, int shape, bool aimed, const CameOverLayer& layer,
                                      Start start) {
  const std::string& name = scene_.node(node).name;
  Motion motion;
  std::string wrong = ReadMotion(node, shape, aimed, &motion);
  if (!wrong.empty()) return wrong;
  compared_.channels += kChannels.size();
  for (const CameOverStream* const stream :
       {&layer.position, &layer.scale, &layer.rotateX, &layer.rotateY, &layer.rotateZ}) {
    if (stream->times.size() == motion.keys) continue;
    return name + " has " + std::to_string(motion.keys) + " keys, " + std::to_string(stream->times.size()) +
           " came over";
  }
  compared_.keys += motion.keys;
  if (motion.keys != 0) {
    wrong = JudgeTimes(node, motion, layer.position, start);
    if (!wrong.empty()) return wrong;
  }
  for (std::size_t key = 0; key < std::max<std::size_t>(motion.keys, 1); ++key) {
    const auto at = motion.keys == 0 ? std::nullopt : std::optional(key);
    const PlainPlace wanted = PlaceOf(PartsAt(node, shape, motion, at));
    const PlainPlace came = PlaceOf(layer, at);
    const std::string where = at ? " at key " + std::to_string(key) : "";
    if (!(OriginsApart(wanted, came) <= kSamePlace)) return name + " came over to another place" + where;
    if (!(AxesApart(wanted, came) <= kSamePlace))
      return name + " came over otherwise turned or scaled" + where;
  }
  const bool turned = std::any_of(motion.channels.begin() + 3, motion.channels.begin() + 6,
                                  [](const Source& one) { return std::fabs(one.stored) > 1.0; });
  if (aimed && turned && !Says({Code::PictureShifts, Code::ShiftNotMeasured}, shape))
    return name + " is aimed and turned once more, and nothing is said of it";
  return "";
}

// Of what a diagnostic says to be lost nothing is left.
PlainParts ChannelJudge::PartsAt(int node, int shape, const Motion& motion,
                                 std::optional<std::size_t> key) const {
  const auto channel = [&](std::size_t which) {
    const Source& source = motion.channels[which];
    if (source.keys() == 0) return source.stored;
    if (source.keys() > 1) return source.value(*key);
    // One key alone: of a node that stands still it is lost where that is said.
    return key || !Says({Code::ChannelsOfOneKey}, node) ? source.value(0) : source.stored;
  };
  const auto triple = [&](const char* x, const char* y, const char* z) {
    return Triple{scene_.Number(node, x, 0.0), scene_.Number(node, y, 0.0), scene_.Number(node, z, 0.0)};
  };
  // Of a camera the shift of its picture says that its angles are lost.
  const bool anglesAreLost =
      scene_.degrees() != 1.0 && Says({Code::PictureShifts, Code::ShiftNotMeasured}, shape);
  const double degrees = anglesAreLost ? kRadian : scene_.degrees();
  PlainParts parts;
  for (std::size_t axis = 0; axis < 3; ++axis) {
    parts.translate[axis] = channel(axis);
    parts.rotate[axis] = channel(3 + axis) * degrees;
    parts.scale[axis] = channel(6 + axis);
  }
  parts.rotatePivot = triple("rpx", "rpy", "rpz");
  parts.scalePivot = triple("spx", "spy", "spz");
  if (!Says({Code::ShearLost}, node)) parts.shear = triple("shxy", "shxz", "shyz");
  if (!Says({Code::PivotTranslationLost}, node)) {
    parts.rotatePivotTranslate = triple("rptx", "rpty", "rptz");
    parts.scalePivotTranslate = triple("sptx", "spty", "sptz");
  }
  if (!Says({Code::RotateAxisLost}, node)) {
    parts.rotateAxis = triple("rax", "ray", "raz");
    for (double& angle : parts.rotateAxis) angle *= degrees;
  }
  if (!Says({Code::RotateOrderLost}, node))
    parts.order = static_cast<std::size_t>(scene_.Number(node, "ro", 0.0));
  return parts;
}

// Time 0 of the composition is the start; a node that begins elsewhere, which is said, begins there too.
std::string ChannelJudge::JudgeTimes(int node, const Motion& motion, const CameOverStream& stream,
                                     Start start) const {
  const std::string& name = scene_.node(node).name;
  if (!cameOver_.composition) return "keys without a composition";
  if (!motion.together) {
    if (Says({Code::KeysAreNoBake}, node)) return "";
    return "the channels of " + name + " have keys at different times, and nothing is said of it";
  }
  const double rate = cameOver_.composition->framesPerSecond;
  const double meant = scene_.framesPerSecond();
  if (std::fabs(rate - meant) > 1e-3 * meant && !SaysAnywhere({Code::RateDiffers}))
    return "the rate differs, and nothing is said of it";
  if (!start) return "";
  // A scene that says no rate has its keys a second apart, which its rate says, too.
  const double unit = !scene_.saysRate() ? 1.0 : scene_.countsFrames() ? rate : meant;
  const bool begins = scene_.countsFrames() && (std::isinf(*start) || Says({Code::KeysStartApart}, node));
  const double zero = begins ? motion.times[0] : *start;
  for (std::size_t key = 0; key < motion.times.size(); ++key) {
    const double wanted = motion.times[key] - zero;
    if (std::fabs(stream.times[key] * unit - wanted) <= kSameFrame) continue;
    return "key " + std::to_string(key) + " of " + name + " is at " + std::to_string(stream.times[key]) +
           " s, not at frame " + std::to_string(wanted);
  }
  return "";
}

std::optional<double> ChannelJudge::FirstKeyOf(int node) const {
  std::optional<double> first;
  for (const Channel& channel : kChannels) {
    const Source source = SourceOf(node, channel.name, channel.neutral);
    if (source.keys() > 1) first = std::min(first.value_or(source.time(0)), source.time(0));
  }
  return first;
}

// The smallest first key of a shape and what stands above it; of a scene that counts no frames, 0.
ChannelJudge::Start ChannelJudge::StartOf(int shape) const {
  if (!scene_.countsFrames() || !scene_.saysRate()) return 0.0;
  double start = std::numeric_limits<double>::infinity();
  const Source lens = SourceOf(shape, "fl", 35.0);
  if (lens.keys() != 0) start = lens.time(0);
  int above = shape;
  for (std::size_t steps = 0; above != kNone && steps <= scene_.nodes().size(); ++steps) {
    if (IsAmbiguous(above)) return std::nullopt;
    if (const auto first = FirstKeyOf(above)) start = std::min(start, *first);
    above = scene_.node(above).parent;
  }
  return start;
}

}  // namespace check_test

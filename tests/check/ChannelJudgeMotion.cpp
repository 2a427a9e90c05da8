// Places: their keys, and the values at them.
#include <algorithm>
#include <array>
#include <cmath>
#include <cstdlib>
#include <limits>
#include <numbers>
#include <numeric>

#include "tests/check/ChannelJudge.h"

namespace check_test {
namespace {

using check::CameOverLayer;
using check::CameOverStream;
using diag::Code;

// The import writes its times in thousandths of a frame.
constexpr double kSameFrame = 1.001e-3;

constexpr std::array<const char*, 3> kRotatePivot = {"rpx", "rpy", "rpz"};

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

const std::array<ChannelJudge::Channel, 9> ChannelJudge::kChannels = {{{"tx", "translateX", 0.0},
                                                                       {"ty", "translateY", 0.0},
                                                                       {"tz", "translateZ", 0.0},
                                                                       {"rx", "rotateX", 0.0},
                                                                       {"ry", "rotateY", 0.0},
                                                                       {"rz", "rotateZ", 0.0},
                                                                       {"sx", "scaleX", 1.0},
                                                                       {"sy", "scaleY", 1.0},
                                                                       {"sz", "scaleZ", 1.0}}};

// A node has one list of times for all of its channels, and begins with the first key of its first curve.
bool ChannelJudge::AreTogether(const Motion& motion, std::size_t channels) {
  if (motion.keys.empty()) return true;
  const auto first = std::find_if(motion.channels.begin(), motion.channels.end(),
                                  [](const Source& channel) { return channel.keys() != 0; });
  const auto lead = std::find_if(motion.channels.begin(), motion.channels.end(),
                                 [](const Source& channel) { return channel.keys() > 1; });
  if (std::fabs(first->time(0) - lead->time(0)) > kSameFrame) return false;
  const auto end = motion.channels.begin() + static_cast<std::ptrdiff_t>(channels);
  return std::all_of(motion.channels.begin(), end, [&](const Source& channel) {
    for (std::size_t i = 0; channel.keys() > 1 && i < motion.keys.size(); ++i) {
      if (std::fabs(channel.time(motion.keys[i]) - motion.times[i]) > 1e-9) return false;
    }
    return true;
  });
}

ChannelJudge::Source ChannelJudge::SourceOf(int node, const std::string& attribute, double neutral) const {
  Source source;
  const PlainDriver* const driver = scene_.DriverOf(node, attribute);
  const bool driven = driver != nullptr;
  const bool byCurve = driven && driver->node != kNone && IsCurve(scene_.node(driver->node)) &&
                       !SaysAt({Code::ConnectionToPath}, driver->text);
  if (byCurve) source.curve = &scene_.node(driver->node);
  source.lost = driven && !byCurve;
  // The report does not say at which value a channel stands still whose driver is lost.
  source.stored =
      driven ? scene_.UsualNumber(node, attribute, neutral) : scene_.Number(node, attribute, neutral);
  if (const auto instead = NumberInstead(node, attribute)) {
    source.skipped = true;
    source.stored = *instead;
  }
  return source;
}

// Takes the keys of the node's first curve that has several, in the order of time. The first of them lies at
// the first key of the node's first curve. Of keys that land on one thousandth of a frame the last one stays,
// where the report says so.
void ChannelJudge::TakeKeys(int node, double first, const Source& lead, Motion* motion) const {
  constexpr double kParts = 1000.0;
  const double begin = scene_.countsFrames() ? first : 0.0;
  const auto landed = [&](std::size_t key) {
    return std::floor(((key == 0 ? first : lead.time(key)) - begin) * kParts + 0.5);
  };
  std::vector<std::size_t> order(lead.keys());
  std::iota(order.begin(), order.end(), 0);
  std::stable_sort(order.begin(), order.end(),
                   [&](std::size_t a, std::size_t b) { return landed(a) < landed(b); });
  const bool said = Says({Code::KeysAtOneTime}, node);
  for (std::size_t i = 0; i < order.size(); ++i) {
    if (said && i + 1 < order.size() && landed(order[i]) == landed(order[i + 1])) continue;
    motion->keys.push_back(order[i]);
    motion->times.push_back(lead.time(order[i]));
  }
}

// Empty where each driver of the node comes over or is reported. Of a target, which has no shape, only the
// drivers of its translation are judged; all of its channels give it keys.
std::string ChannelJudge::ReadMotion(int node, int shape, bool aimed, Motion* motion) const {
  std::optional<double> first;
  for (const Channel& channel : kChannels) {
    const Source source = SourceOf(node, channel.name, channel.neutral);
    motion->channels.push_back(source);
    if (source.keys() != 0 && !first) first = source.time(0);
    if (source.keys() > 1 && motion->keys.empty()) TakeKeys(node, *first, source, motion);
    const bool counts = shape != kNone || channel.name[0] == 't';
    const std::string wrong =
        source.curve != nullptr || !counts ? "" : JudgeDriver(node, shape, aimed, channel);
    if (!wrong.empty()) return wrong;
  }
  motion->together = AreTogether(*motion, shape == kNone ? 3 : kChannels.size());
  return "";
}

// Judges a driver that is not a curve of the import.
std::string ChannelJudge::JudgeDriver(int node, int shape, bool aimed, const Channel& channel) const {
  const PlainDriver* const driver = scene_.DriverOf(node, channel.name);
  if (driver == nullptr || SaysAt({Code::ConnectionToPath}, driver->text)) return "";
  const std::string by = driver->node == kNone ? driver->sourcePlug.substr(0, driver->sourcePlug.find('.'))
                                               : scene_.node(driver->node).name;
  const bool ownLookAt = shape != kNone && scene_.node(shape).parent == node && driver->node != kNone &&
                         IsLookAt(scene_.node(driver->node)) && channel.name[0] == 'r';
  if (ownLookAt &&
      (aimed || SaysWith({Code::LookAtShortNames, Code::LookAtNotTaken}, {by, scene_.node(shape).name})))
    return "";
  if (SaysOfChannel(node, channel.longName, by)) return "";
  return "nothing is said of " + by + ", which drives " + scene_.node(node).name + '.' + channel.name;
}

std::string ChannelJudge::JudgeMotion(int node, int shape, bool aimed, const CameOverLayer& layer,
                                      Start start) {
  const std::string& name = scene_.node(node).name;
  Motion motion;
  std::string wrong = ReadMotion(node, shape, aimed, &motion);
  if (!wrong.empty()) return wrong;
  compared_.channels += kChannels.size();
  const std::array<const CameOverStream*, 5> streams = {&layer.position, &layer.scale, &layer.rotateX,
                                                        &layer.rotateY, &layer.rotateZ};
  for (const CameOverStream* const stream : streams) {
    if (stream->times.size() == motion.keys.size()) continue;
    return name + " has " + std::to_string(motion.keys.size()) + " keys, " +
           std::to_string(stream->times.size()) + " came over";
  }
  compared_.keys += motion.keys.size();
  for (const CameOverStream* const stream : streams) {
    wrong = motion.keys.empty() ? "" : JudgeTimes(node, motion, *stream, start);
    if (!wrong.empty()) return wrong;
  }
  for (std::size_t key = 0; key < std::max<std::size_t>(motion.keys.size(), 1); ++key) {
    const auto at = motion.keys.empty() ? std::nullopt : std::optional(key);
    const PlainPlace wanted = PlaceOf(PartsAt(node, motion, at));
    const PlainPlace came = PlaceOf(layer, at);
    const std::string where = at ? " at key " + std::to_string(key) : "";
    if (!(OriginsApart(wanted, came) <= kSamePlace)) return name + " came over to another place" + where;
    if (!(AxesApart(wanted, came) <= kSamePlace))
      return name + " came over otherwise turned or scaled" + where;
  }
  return aimed ? JudgeAim(node, shape, motion) : "";
}

// An aimed layer keeps its own rotation and pivot, which the scene does not show.
std::string ChannelJudge::JudgeAim(int node, int shape, const Motion& motion) const {
  const std::string& name = scene_.node(node).name;
  const bool turned = std::any_of(motion.channels.begin() + 3, motion.channels.begin() + 6,
                                  [](const Source& one) { return std::fabs(one.stored) > 1.0; });
  if (turned && !Says({Code::PictureShifts, Code::ShiftNotMeasured}, shape))
    return name + " is aimed and turned once more, and nothing is said of it";
  const bool pivot = std::any_of(kRotatePivot.begin(), kRotatePivot.end(), [&](const char* attribute) {
    return scene_.Number(node, attribute, 0.0) != 0.0;
  });
  if (pivot && !Says({Code::AimedPivotLost}, node))
    return name + " is aimed and has a pivot, and nothing is said of it";
  return "";
}

// The parts of the transform, without what a diagnostic says to be lost.
PlainParts ChannelJudge::PartsAt(int node, const Motion& motion, std::optional<std::size_t> key) const {
  const auto channel = [&](std::size_t which) {
    const Source& source = motion.channels[which];
    if (source.keys() == 0) return source.stored;
    if (source.keys() > 1) return source.value(motion.keys[*key]);
    // A single key is lost where the node stands still and the report says so.
    const bool lost = !key && (source.skipped || Says({Code::ChannelsOfOneKey}, node));
    return lost ? source.stored : source.value(0);
  };
  const auto triple = [&](const char* x, const char* y, const char* z) {
    return Triple{scene_.Number(node, x, 0.0), scene_.Number(node, y, 0.0), scene_.Number(node, z, 0.0)};
  };
  const bool radians = scene_.degrees() != 1.0;
  const bool said = Says({Code::RadiansLost}, node);
  PlainParts parts;
  for (std::size_t axis = 0; axis < 3; ++axis) {
    const Source& angle = motion.channels[3 + axis];
    const bool lost = angle.lost || (!key && angle.keys() == 1);
    parts.translate[axis] = channel(axis);
    parts.rotate[axis] = channel(3 + axis) * (radians && (lost || said) ? kRadian : scene_.degrees());
    parts.scale[axis] = channel(6 + axis);
  }
  const Source& x = motion.channels[0];
  const bool limited = scene_.Number(node, "xtxe", 0.0) == 1.0 && !x.lost && !x.skipped &&
                       (key || x.keys() != 1) && !Says({Code::LimitLost}, node);
  if (limited) parts.translate[0] = std::min(parts.translate[0], scene_.Number(node, "mxtx", 1.0));
  if (!Says({Code::OffsetMatrixLost}, node)) parts.offset[0] = scene_.Number(node, "opmx", 0.0);
  parts.rotatePivot = triple(kRotatePivot[0], kRotatePivot[1], kRotatePivot[2]);
  parts.scalePivot = triple("spx", "spy", "spz");
  if (!Says({Code::ShearLost}, node)) parts.shear = triple("shxy", "shxz", "shyz");
  if (!Says({Code::PivotTranslationLost}, node)) {
    parts.rotatePivotTranslate = triple("rptx", "rpty", "rptz");
    parts.scalePivotTranslate = triple("sptx", "spty", "sptz");
  }
  if (!Says({Code::RotateAxisLost}, node)) {
    parts.rotateAxis = triple("rax", "ray", "raz");
    for (double& angle : parts.rotateAxis) angle *= scene_.degrees();
  }
  if (!Says({Code::RotateOrderLost}, node))
    parts.order = static_cast<std::size_t>(scene_.Number(node, "ro", 0.0));
  return parts;
}

// Time 0 of the composition is the start. A node that begins elsewhere is reported, and begins there too.
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
  // A single key holds for all times.
  if (motion.times.size() == 1 && stream.times[0] == 0.0) return "";
  // A scene that gives no rate has its keys a second apart, and a report of its rate.
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

// The time of the first key of the first curve of an animated node.
std::optional<double> ChannelJudge::FirstKeyOf(int node) const {
  std::optional<double> first;
  bool animated = false;
  for (const Channel& channel : kChannels) {
    const Source source = SourceOf(node, channel.name, channel.neutral);
    if (source.keys() != 0 && !first) first = source.time(0);
    animated = animated || source.keys() > 1;
  }
  return animated ? first : std::nullopt;
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
    if (Says({Code::ParentIsPath, Code::ParentNotImported, Code::ParentElsewhere}, above)) break;
    above = scene_.node(above).parent;
  }
  return start;
}

// Of the first camera that came over with keys.
ChannelJudge::Start ChannelJudge::StartOfCameras() const {
  for (int id = 0; id < static_cast<int>(scene_.nodes().size()); ++id) {
    const PlainNode& node = scene_.node(id);
    const auto& layers = cameOver_.layers;
    const bool cameOver =
        IsCamera(node) && std::any_of(layers.begin(), layers.end(), [&](const CameOverLayer& layer) {
          return layer.kind == check::LayerKind::Camera && layer.name == node.name;
        });
    if (!cameOver) continue;
    const Start start = StartOf(id);
    if (!start || !std::isinf(*start)) return start;
  }
  return std::numeric_limits<double>::infinity();
}

// Locators and targets begin with the cameras; where those have no keys, with one of themselves: with the one
// that the report names, and the first where they begin alike.
ChannelJudge::Start ChannelJudge::StartOfOthers(std::optional<double> first) {
  if (!scene_.countsFrames() || !scene_.saysRate()) return 0.0;
  if (!others_ || !std::isinf(*others_) || !first) return others_;
  others_ = first;
  for (const check::Finding& finding : report_.findings) {
    if (finding.diagnostic.code != Code::KeysStartApart) continue;
    others_ = std::strtod(finding.diagnostic.arguments[3].c_str(), nullptr);
  }
  return others_;
}

}  // namespace check_test

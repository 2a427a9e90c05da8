// Zooms and points of interest: their keys, and the values at them.
#include <algorithm>
#include <cmath>

#include "tests/check/ChannelJudge.h"

namespace check_test {

using check::CameOverLayer;
using diag::Code;

bool ChannelJudge::IsLookAt(const PlainNode& node) {
  return node.type == "lookAt" || node.type == "aimConstraint";
}

std::string ChannelJudge::JudgeZoom(int shape, const CameOverLayer& layer, Start start) {
  const std::string& name = scene_.node(shape).name;
  const Source lens = SourceOf(shape, "fl", 35.0);
  ++compared_.channels;
  if (IsAmbiguous(shape)) return "";
  const PlainDriver* const driver = scene_.DriverOf(shape, "fl");
  if (driver != nullptr && lens.curve == nullptr && !SaysAt({Code::ConnectionToPath}, driver->text) &&
      !SaysWith({Code::FocalLengthElsewhere}, {name}))
    return "nothing is said of what drives the focal length of " + name;
  Motion motion;
  if (lens.keys() != 0) TakeKeys(shape, lens.time(0), lens, &motion);
  const std::size_t keys = motion.keys.size();
  if (layer.zoom.times.size() != keys)
    return name + " has " + std::to_string(keys) + " zoom keys, " + std::to_string(layer.zoom.times.size()) +
           " came over";
  compared_.keys += keys;
  const std::string wrong = motion.times.empty() ? "" : JudgeTimes(shape, motion, layer.zoom, start);
  if (!wrong.empty()) return wrong;
  // The default aperture has five digits, and a pixel aspect is shown in thousandths.
  const double same = cameOver_.composition->pixelAspect == 1.0 ? 3e-5 : 1e-3;
  const double factor = ZoomOfAnInch(shape);
  for (std::size_t key = 0; key < std::max<std::size_t>(keys, 1); ++key) {
    const double wanted = (keys == 0 ? lens.stored : lens.value(motion.keys[key])) / 25.4 * factor;
    const double came = keys == 0 ? layer.zoom.value[0] : layer.zoom.values[key];
    if (!(std::fabs(came - wanted) <= same * std::fabs(wanted)))
      return name + " has the zoom " + std::to_string(came) + ", not " + std::to_string(wanted);
  }
  return "";
}

// The zoom, in pixels, of a lens of one inch: without what a diagnostic says to be lost.
double ChannelJudge::ZoomOfAnInch(int shape) const {
  const double across = scene_.Number(shape, "hfa", 1.41732);
  const double down = scene_.Number(shape, "vfa", 0.94488);
  const double squeeze = scene_.Number(shape, "lsr", 1.0);
  const double fit = scene_.Number(shape, "ff", 1.0);
  const double picture = scene_.resolution("w", 960.0) / scene_.resolution("h", 540.0);
  const bool wide = across * squeeze / down > picture;
  const bool byHeight =
      !Says({Code::FitDiffers}, shape) && (fit == 2.0 || (fit == 0.0 && wide) || (fit == 3.0 && !wide));
  const double scale = Says({Code::CameraScaleLost}, shape) ? 1.0 : scene_.Number(shape, "cs", 1.0);
  if (byHeight) return cameOver_.composition->height / down / scale;
  const double width = cameOver_.composition->width * cameOver_.composition->pixelAspect;
  return width / (across * (Says({Code::LensSqueezeLost}, shape) ? 1.0 : squeeze)) / scale;
}

// The look-at that turns the transform; kNone where there is none.
int ChannelJudge::LookAtOf(int transform) const {
  for (const auto& [attribute, driver] : scene_.DriversOf(transform)) {
    const bool turns = attribute == "r" || attribute == "rx" || attribute == "ry" || attribute == "rz";
    if (turns && driver.node != kNone && IsLookAt(scene_.node(driver.node))) return driver.node;
  }
  return kNone;
}

// The node that the target of the look-at comes from, as a whole or by its components.
int ChannelJudge::TargetOf(int lookAt) const {
  int target = kNone;
  for (const auto& [attribute, driver] : scene_.DriversOf(lookAt)) {
    if (attribute.starts_with("target") && attribute.find("targetTranslate") != std::string::npos)
      target = driver.node;
  }
  return target;
}

std::string ChannelJudge::JudgeInterest(int transform, int shape, const CameOverLayer& layer) {
  if (IsAmbiguous(shape) || IsAmbiguous(transform)) return "";
  const std::string& name = scene_.node(shape).name;
  const int lookAt = LookAtOf(transform);
  if (lookAt == kNone) return layer.aimed ? name + " is aimed, and the scene has no look-at" : "";
  if (!layer.aimed) return "";  // whether the report says so is judged with the motion of the transform
  if (SaysWith({Code::LookAtWeightLast}, {scene_.node(lookAt).name, name})) return "";
  const int target = TargetOf(lookAt);
  if (target == kNone) return name + " is aimed, and its look-at has no target";
  Motion motion;
  std::string wrong = ReadMotion(target, kNone, false, &motion);
  if (!wrong.empty()) return wrong;
  ++compared_.channels;
  const std::size_t keys = motion.keys.size();
  compared_.keys += keys;
  if (layer.interest.times.size() != keys)
    return "what " + name + " is aimed at has " + std::to_string(keys) + " keys, " +
           std::to_string(layer.interest.times.size()) + " came over";
  const auto end = motion.channels.begin() + 3;
  const auto isDriven = [](const Source& channel) { return channel.keys() != 0; };
  const bool moves =
      std::any_of(motion.channels.begin(), end, [](const Source& channel) { return channel.keys() > 1; });
  if (moves) {
    const double first = std::find_if(motion.channels.begin(), end, isDriven)->time(0);
    wrong = JudgeTimes(target, motion, layer.interest, StartOfOthers(first));
  }
  if (!wrong.empty()) return wrong;
  for (std::size_t key = 0; key < std::max<std::size_t>(keys, 1); ++key) {
    const auto at = keys == 0 ? std::nullopt : std::optional(key);
    const Triple wanted = PartsAt(target, motion, at).translate;
    const Triple came = StreamAt(layer.interest, at, 3);
    if (!(OriginsApart(Moved(wanted), Moved({came[0], -came[1], -came[2]})) <= kSamePlace))
      return name + " is aimed at another place than that of " + scene_.node(target).name;
  }
  return "";
}

}  // namespace check_test

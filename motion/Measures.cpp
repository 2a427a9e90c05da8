#include "motion/Measures.h"

#include <algorithm>
#include <array>
#include <iterator>

#include "scene/Units.h"

namespace motion {
namespace {

constexpr double kTicksPerSecond = 6000.0;
constexpr double kFilmFramesPerSecond = 24.0;

constexpr std::array<std::string_view, 4> kClockUnits = {"sec", "min", "hour", "millisec"};

// Without the X, Y or Z at the end.
constexpr std::string_view kLengths[] = {
    "translate",
    "rotatePivot",
    "rotatePivotTranslate",
    "scalePivot",
    "scalePivotTranslate",
    "targetTranslate",
    "targetRotatePivot",
    "targetRotateTranslate",
    "targetOffsetTranslate",
    "constraintTranslate",
    "constraintRotatePivot",
    "constraintRotateTranslate",
    "inTranslateX1",
    "inTranslateY1",
    "inTranslateZ1",
    "inTranslateX2",
    "inTranslateY2",
    "inTranslateZ2",
    "outTranslate",
    "restTranslate",
    "localPosition",
    "orthographicWidth",
    "centerOfInterest",
    "focusDistance",
    "nearClipPlane",
    "farClipPlane",
    "distanceBetween",
    "interaxialSeparation",
    "zeroParallax",
    "stereoLeftOffset",
    "stereoRightOffset",
};
constexpr std::string_view kAngles[] = {
    "rotate",
    "rotateAxis",
    "jointOrient",
    "targetRotate",
    "targetJointOrient",
    "targetOffsetRotate",
    "constraintRotate",
    "constraintJointOrient",
    "twist",
    "inRotateX1",
    "inRotateY1",
    "inRotateZ1",
    "inRotateX2",
    "inRotateY2",
    "inRotateZ2",
    "outRotate",
    "restRotate",
    "shutterAngle",
    "stereoLeftAngle",
    "stereoRightAngle",
};

bool IsOneOf(std::string_view name, const auto& names) {
  return std::find(std::begin(names), std::end(names), name) != std::end(names);
}

std::string_view WithoutAxis(std::string_view name) {
  const bool axis = !name.empty() && name.back() >= 'X' && name.back() <= 'Z';
  return axis ? name.substr(0, name.size() - 1) : name;
}

// animCurveTA: the last letter is the kind of the output, the one before that of the input.
Kind KindOfCurve(std::string_view type, std::string_view attribute) {
  if (attribute == "input")
    return type.substr(0, type.size() - 1).ends_with('T') ? Kind::kTime : Kind::kPlain;
  if (attribute != "output") return Kind::kPlain;
  switch (type.back()) {
    case 'L':
      return Kind::kLength;
    case 'A':
      return Kind::kAngle;
    case 'T':
      return Kind::kTime;
    default:
      return Kind::kPlain;
  }
}

// The offset of a constraint measures what the constraint sets.
Kind KindOfOffset(std::string_view type) {
  if (type == "pointConstraint") return Kind::kLength;
  return type == "scaleConstraint" ? Kind::kPlain : Kind::kAngle;
}

Kind KindOfBlend(std::string_view type, std::string_view attribute) {
  const bool value = attribute == "inputA" || attribute == "inputB" || attribute == "output";
  if (!value) return Kind::kPlain;
  if (type.ends_with("DL") || type.ends_with("FL")) return Kind::kLength;
  return type.ends_with("DA") || type.ends_with("FA") ? Kind::kAngle : Kind::kPlain;
}

// What addAttr's types measure.
Kind KindOfAdded(std::string_view type) {
  if (type == "doubleAngle" || type == "floatAngle") return Kind::kAngle;
  if (type == "doubleLinear" || type == "floatLinear") return Kind::kLength;
  return type == "time" ? Kind::kTime : Kind::kPlain;
}

// Their inputs have the kind of what drives them.
bool TakesAnything(std::string_view type) { return type == "unitConversion" || type == "blendWeighted"; }

Kind KindByName(const scene::Scene& scene, const scene::Plug& plug) {
  const std::string_view type = scene.node(plug.node).type;
  const std::string_view attribute = WithoutAxis(plug.attribute);
  if (const scene::AddedAttribute* const added = scene.Added(plug.node, plug.attribute)) {
    return KindOfAdded(added->type);
  }
  if (type.starts_with("animCurve")) return KindOfCurve(type, plug.attribute);
  if (type.starts_with("animBlendNodeAdditive")) return KindOfBlend(type, plug.attribute);
  if (type == "time") return plug.attribute == "outTime" ? Kind::kTime : Kind::kPlain;
  if (attribute == "offset" && scene::FindAttribute(type, "offset") != nullptr) return KindOfOffset(type);
  if (IsOneOf(attribute, kLengths) || IsOneOf(plug.attribute, kLengths)) return Kind::kLength;
  return IsOneOf(attribute, kAngles) || IsOneOf(plug.attribute, kAngles) ? Kind::kAngle : Kind::kPlain;
}

}  // namespace

Measures MeasuresOf(const scene::Scene& scene) {
  Measures measures;
  if (const auto rate = scene::TimeUnitOf(scene.timeUnit().word))
    measures.framesPerSecond = rate->perSecond();
  if (const auto length = scene::LinearUnitOf(scene.linearUnit().word)) measures.centimetres = *length;
  if (scene::AngularUnitOf(scene.angularUnit().word) == scene::AngularUnit::Radian) measures.radians = 1.0;
  return measures;
}

bool IsClockUnit(std::string_view word) {
  return std::find(kClockUnits.begin(), kClockUnits.end(), word) != kClockUnits.end();
}

double UnitsPerFrame(const scene::Scene& scene) {
  if (!IsClockUnit(scene.timeUnit().word)) return 1.0;
  return MeasuresOf(scene).framesPerSecond / kFilmFramesPerSecond;
}

Kind KindOf(const scene::Scene& scene, const scene::Plug& plug) {
  if (TakesAnything(scene.node(plug.node).type) && plug.attribute == "input") {
    const auto driver = scene.SourceOf(plug);
    return driver ? KindByName(scene, driver->plug) : Kind::kPlain;
  }
  return KindByName(scene, plug);
}

double InternalUnits(const Measures& measures, Kind kind) {
  switch (kind) {
    case Kind::kLength:
      return measures.centimetres;
    case Kind::kAngle:
      return measures.radians;
    case Kind::kTime:
      return kTicksPerSecond / measures.framesPerSecond;
    case Kind::kPlain:
      break;
  }
  return 1.0;
}

}  // namespace motion

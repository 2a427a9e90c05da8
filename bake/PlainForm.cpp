#include "bake/PlainForm.h"

#include <algorithm>
#include <string_view>

namespace bake {
namespace {

constexpr std::string_view kMustBeZero[] = {
    "rotateOrder",
    "rotateAxisX",
    "rotateAxisY",
    "rotateAxisZ",
    "rotatePivotX",
    "rotatePivotY",
    "rotatePivotZ",
    "rotatePivotTranslateX",
    "rotatePivotTranslateY",
    "rotatePivotTranslateZ",
    "scalePivotX",
    "scalePivotY",
    "scalePivotZ",
    "scalePivotTranslateX",
    "scalePivotTranslateY",
    "scalePivotTranslateZ",
    "shearXY",
    "shearXZ",
    "shearYZ",
    "minTransXLimitEnable",
    "minTransYLimitEnable",
    "minTransZLimitEnable",
    "maxTransXLimitEnable",
    "maxTransYLimitEnable",
    "maxTransZLimitEnable",
    "minRotXLimitEnable",
    "minRotYLimitEnable",
    "minRotZLimitEnable",
    "maxRotXLimitEnable",
    "maxRotYLimitEnable",
    "maxRotZLimitEnable",
    "minScaleXLimitEnable",
    "minScaleYLimitEnable",
    "minScaleZLimitEnable",
    "maxScaleXLimitEnable",
    "maxScaleYLimitEnable",
    "maxScaleZLimitEnable",
};

constexpr std::string_view kOfJoints[] = {
    "jointOrientX",
    "jointOrientY",
    "jointOrientZ",
};

constexpr std::string_view kInherits = "inheritsTransform";

bool IsZero(const scene::Scene& scene, scene::NodeId node, std::string_view attribute) {
  return !scene.SourceOf(scene.PlugOf(node, attribute)) && scene.Number(node, attribute).value_or(0.0) == 0.0;
}

bool AreZero(const scene::Scene& scene, scene::NodeId node, const auto& attributes) {
  return std::all_of(std::begin(attributes), std::end(attributes),
                     [&](std::string_view attribute) { return IsZero(scene, node, attribute); });
}

}  // namespace

bool IsPlain(const scene::Scene& scene, scene::NodeId node) {
  constexpr std::string_view kOffset = "offsetParentMatrix";
  if (scene.Written(node, kOffset) || scene.SourceOf(scene.PlugOf(node, kOffset))) return false;
  if (!AreZero(scene, node, kMustBeZero)) return false;
  if (scene.node(node).type != "joint") return true;
  return AreZero(scene, node, kOfJoints) && IsZero(scene, node, "segmentScaleCompensate");
}

bool Inherits(const scene::Scene& scene, scene::NodeId node) {
  return scene.Number(node, kInherits).value_or(1.0) != 0.0;
}

bool IsInheritanceDriven(const scene::Scene& scene, scene::NodeId node) {
  return scene.SourceOf(scene.PlugOf(node, kInherits)).has_value();
}

}  // namespace bake

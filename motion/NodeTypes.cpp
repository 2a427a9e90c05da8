#include "motion/NodeTypes.h"

#include <algorithm>
#include <iterator>

namespace motion {
namespace {

constexpr std::string_view kOutput[] = {"output"};
constexpr std::string_view kTime[] = {"outTime"};
constexpr std::string_view kTranslate[] = {"constraintTranslateX", "constraintTranslateY",
                                           "constraintTranslateZ"};
constexpr std::string_view kRotate[] = {"constraintRotateX", "constraintRotateY", "constraintRotateZ"};
constexpr std::string_view kScale[] = {"constraintScaleX", "constraintScaleY", "constraintScaleZ"};
constexpr std::string_view kPose[] = {"constraintTranslateX", "constraintTranslateY", "constraintTranslateZ",
                                      "constraintRotateX",    "constraintRotateY",    "constraintRotateZ"};
constexpr std::string_view kBlendedPose[] = {"outTranslateX", "outTranslateY", "outTranslateZ",
                                             "outRotateX",    "outRotateY",    "outRotateZ"};

constexpr std::string_view kEyes[] = {"stereoLeftOffset",  "stereoLeftAngle",  "filmBackOutputLeft",
                                      "stereoRightOffset", "stereoRightAngle", "filmBackOutputRight"};

constexpr NodeType kTypes[] = {
    {"aimConstraint", kRotate, MakeAim},
    {"animBlendNodeAdditive", kOutput, MakeAdditiveBlend},
    {"animBlendNodeAdditiveDA", kOutput, MakeAdditiveBlend},
    {"animBlendNodeAdditiveDL", kOutput, MakeAdditiveBlend},
    {"animBlendNodeAdditiveF", kOutput, MakeAdditiveBlend},
    {"animBlendNodeAdditiveFA", kOutput, MakeAdditiveBlend},
    {"animBlendNodeAdditiveFL", kOutput, MakeAdditiveBlend},
    {"animCurveTA", kOutput, MakeCurve},
    {"animCurveTL", kOutput, MakeCurve},
    {"animCurveTT", kOutput, MakeCurve},
    {"animCurveTU", kOutput, MakeCurve},
    {"animCurveUA", kOutput, MakeCurve},
    {"animCurveUL", kOutput, MakeCurve},
    {"animCurveUT", kOutput, MakeCurve},
    {"animCurveUU", kOutput, MakeCurve},
    {"blendWeighted", kOutput, MakeWeightedBlend},
    {"lookAt", kRotate, MakeAim},
    {"orientConstraint", kRotate, MakeOrient},
    {"pairBlend", kBlendedPose, MakePairBlend},
    {"parentConstraint", kPose, MakeParent},
    {"pointConstraint", kTranslate, MakePoint},
    {"scaleConstraint", kScale, MakeScale},
    {"stereoRigTransform", kEyes, MakeStereo},
    {"time", kTime, MakeTime},
    {"unitConversion", kOutput, MakeUnitConversion},
};
static_assert(std::is_sorted(std::begin(kTypes), std::end(kTypes),
                             [](const NodeType& a, const NodeType& b) { return a.name < b.name; }));

}  // namespace

const NodeType* FindNodeType(std::string_view name) {
  const auto found =
      std::lower_bound(std::begin(kTypes), std::end(kTypes), name,
                       [](const NodeType& type, std::string_view wanted) { return type.name < wanted; });
  return found == std::end(kTypes) || found->name != name ? nullptr : &*found;
}

int OutputOf(const NodeType& type, std::string_view attribute) {
  const auto found = std::find(type.outputs.begin(), type.outputs.end(), attribute);
  return found == type.outputs.end() ? -1 : static_cast<int>(found - type.outputs.begin());
}

}  // namespace motion

#include "motion/ConstraintBinding.h"

#include <cmath>

namespace motion {

bool BoundNode::Take() {
  node.order = RotateOrderOf(CodeOf(order));
  return Invert(parentInverse, &node.parentMatrix);
}

void BindConstrainedNode(Binder* binder, BoundNode* bound) {
  binder->Point("constraintRotatePivot", &bound->node.rotatePivot);
  binder->Point("constraintRotateTranslate", &bound->node.rotatePivotTranslate);
  binder->Point("constraintJointOrient", &bound->node.jointOrient);
  binder->Number("constraintRotateOrder", &bound->order);
  binder->MatrixOf("constraintParentInverseMatrix", &bound->parentInverse);
}

std::vector<std::int32_t> TargetIndices(const Binder& binder) {
  constexpr std::string_view kTargetAttributes[] = {
      "targetTranslate", "targetTranslateX",   "targetRotate", "targetRotateX",         "targetScale",
      "targetScaleX",    "targetParentMatrix", "targetWeight", "targetOffsetTranslate", "targetOffsetRotate"};
  return binder.Indices(kTargetAttributes);
}

void BindTargetPoint(Binder* binder, std::int32_t index, TargetPoint* target) {
  binder->Point("targetTranslate", &target->translate, index);
  binder->Point("targetRotatePivot", &target->rotatePivot, index);
  binder->Point("targetRotateTranslate", &target->rotatePivotTranslate, index);
  binder->MatrixOf("targetParentMatrix", &target->parentMatrix, index);
  binder->Number("targetWeight", &target->weight, index);
}

int CodeOf(double number) {
  constexpr double kMost = 1000.0;
  return std::fabs(number) <= kMost ? static_cast<int>(number) : -1;
}

}  // namespace motion

// parentConstraint: the pose of a node that is held by its targets.
#include "motion/ConstraintBinding.h"
#include "motion/Constraints.h"
#include "motion/NodeTypes.h"

namespace motion {
namespace {

struct BoundParent {
  TargetParent target;
  double order = 0.0;
};

class ParentStep final : public NumberStep {
 public:
  explicit ParentStep(double radians) : radians_(radians) {}

  BoundNode bound;
  std::vector<BoundParent> targets;

 private:
  bool Compute(double, double* outputs) override {
    std::vector<TargetParent> parents;
    for (BoundParent& bounded : targets) {
      bounded.target.order = RotateOrderOf(CodeOf(bounded.order));
      parents.push_back(bounded.target);
    }
    Pose pose;
    if (!bound.Take() || !ParentConstraint(parents, bound.node, {}, &pose)) return false;
    for (const int axis : {0, 1, 2}) {
      outputs[axis] = pose.translate[axis];
      outputs[3 + axis] = pose.rotate[axis] / radians_;
    }
    return true;
  }

  double radians_;
};

}  // namespace

std::unique_ptr<NumberStep> MakeParent(Binder* binder) {
  auto step = std::make_unique<ParentStep>(binder->measures().radians);
  binder->Begin(step.get());
  BindConstrainedNode(binder, &step->bound);
  const std::vector<std::int32_t> indices = TargetIndices(*binder);
  step->targets.resize(indices.size());
  for (std::size_t i = 0; i < indices.size(); ++i) {
    TargetParent& target = step->targets[i].target;
    binder->Point("targetTranslate", &target.translate, indices[i]);
    binder->Point("targetRotate", &target.rotate, indices[i]);
    binder->Point("targetScale", &target.scale, indices[i]);
    binder->Number("targetRotateOrder", &step->targets[i].order, indices[i]);
    binder->Point("targetJointOrient", &target.jointOrient, indices[i]);
    binder->Point("targetRotatePivot", &target.rotatePivot, indices[i]);
    binder->Point("targetRotateTranslate", &target.rotatePivotTranslate, indices[i]);
    binder->MatrixOf("targetParentMatrix", &target.parentMatrix, indices[i]);
    binder->Point("targetOffsetTranslate", &target.offsetTranslate, indices[i]);
    binder->Point("targetOffsetRotate", &target.offsetRotate, indices[i]);
    binder->Number("targetWeight", &target.weight, indices[i]);
  }
  if (indices.size() > 1) binder->ReportNode(diag::Code::SeveralTargets);
  return step;
}

}  // namespace motion

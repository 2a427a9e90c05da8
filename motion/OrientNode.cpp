// orientConstraint: the angles that turn a node as its targets are turned.
#include "motion/ConstraintBinding.h"
#include "motion/Constraints.h"
#include "motion/NodeTypes.h"

namespace motion {
namespace {

struct BoundRotation {
  TargetRotation target;
  double order = 0.0;
};

class OrientStep final : public NumberStep {
 public:
  explicit OrientStep(double radians) : radians_(radians) {}

  BoundNode bound;
  Vector offset;
  std::vector<BoundRotation> targets;

 private:
  bool Compute(double, double* outputs) override {
    std::vector<TargetRotation> rotations;
    for (BoundRotation& bounded : targets) {
      bounded.target.order = RotateOrderOf(CodeOf(bounded.order));
      rotations.push_back(bounded.target);
    }
    Vector angles;
    if (!bound.Take() || !OrientConstraint(rotations, bound.node, offset, {}, &angles)) return false;
    for (const int axis : {0, 1, 2}) outputs[axis] = angles[axis] / radians_;
    return true;
  }

  double radians_;
};

}  // namespace

std::unique_ptr<NumberStep> MakeOrient(Binder* binder) {
  auto step = std::make_unique<OrientStep>(binder->measures().radians);
  binder->Begin(step.get());
  BindConstrainedNode(binder, &step->bound);
  binder->Point("offset", &step->offset);
  const std::vector<std::int32_t> indices = TargetIndices(*binder);
  step->targets.resize(indices.size());
  for (std::size_t i = 0; i < indices.size(); ++i) {
    TargetRotation& target = step->targets[i].target;
    binder->Point("targetRotate", &target.rotate, indices[i]);
    binder->Number("targetRotateOrder", &step->targets[i].order, indices[i]);
    binder->Point("targetJointOrient", &target.jointOrient, indices[i]);
    binder->MatrixOf("targetParentMatrix", &target.parentMatrix, indices[i]);
    binder->Number("targetWeight", &target.weight, indices[i]);
  }
  if (indices.size() > 1) binder->ReportNode(diag::Code::SeveralTargets);
  return step;
}

}  // namespace motion

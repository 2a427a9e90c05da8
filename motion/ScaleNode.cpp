// scaleConstraint: the scale that makes a node as large as its targets.
#include "motion/ConstraintBinding.h"
#include "motion/Constraints.h"
#include "motion/NodeTypes.h"

namespace motion {
namespace {

class ScaleStep final : public NumberStep {
 public:
  BoundNode bound;
  Vector offset{1.0, 1.0, 1.0};
  std::vector<TargetScale> targets;

 private:
  bool Compute(double, double* outputs) override {
    Vector scale;
    if (!bound.Take() || !ScaleConstraint(targets, bound.node.parentMatrix, offset, &scale)) return false;
    for (const int axis : {0, 1, 2}) outputs[axis] = scale[axis];
    return true;
  }
};

}  // namespace

std::unique_ptr<NumberStep> MakeScale(Binder* binder) {
  auto step = std::make_unique<ScaleStep>();
  binder->Begin(step.get());
  binder->Point("offset", &step->offset);
  binder->MatrixOf("constraintParentInverseMatrix", &step->bound.parentInverse);
  const std::vector<std::int32_t> indices = TargetIndices(*binder);
  step->targets.resize(indices.size());
  for (std::size_t i = 0; i < indices.size(); ++i) {
    binder->Point("targetScale", &step->targets[i].scale, indices[i]);
    binder->MatrixOf("targetParentMatrix", &step->targets[i].parentMatrix, indices[i]);
    binder->Number("targetWeight", &step->targets[i].weight, indices[i]);
  }
  if (indices.size() > 1) binder->ReportNode(diag::Code::SeveralTargets);
  return step;
}

}  // namespace motion

// pointConstraint: the translation that puts a node on its targets.
#include "motion/ConstraintBinding.h"
#include "motion/Constraints.h"
#include "motion/NodeTypes.h"

namespace motion {
namespace {

class PointStep final : public NumberStep {
 public:
  BoundNode bound;
  Vector offset;
  std::vector<TargetPoint> targets;

 private:
  bool Compute(double, double* outputs) override {
    Vector translate;
    if (!bound.Take() || !PointConstraint(targets, bound.node, offset, &translate)) return false;
    for (const int axis : {0, 1, 2}) outputs[axis] = translate[axis];
    return true;
  }
};

}  // namespace

std::unique_ptr<NumberStep> MakePoint(Binder* binder) {
  auto step = std::make_unique<PointStep>();
  binder->Begin(step.get());
  BindConstrainedNode(binder, &step->bound);
  binder->Point("offset", &step->offset);
  const std::vector<std::int32_t> indices = TargetIndices(*binder);
  step->targets.resize(indices.size());
  for (std::size_t i = 0; i < indices.size(); ++i) BindTargetPoint(binder, indices[i], &step->targets[i]);
  return step;
}

}  // namespace motion

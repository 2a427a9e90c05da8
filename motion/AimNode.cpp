// aimConstraint and lookAt: the angles that turn a node towards its targets.
#include "motion/ConstraintBinding.h"
#include "motion/NodeTypes.h"

namespace motion {
namespace {

class AimStep final : public NumberStep {
 public:
  explicit AimStep(double radians) : radians_(radians) {}

  Aim aim;
  double upType = static_cast<double>(UpType::kVector);
  BoundNode bound;
  std::vector<TargetPoint> targets;

 private:
  bool Compute(double, double* outputs) override {
    Vector angles;
    aim.upType = UpTypeOf(CodeOf(upType));
    if (!bound.Take() || !AimAngles(aim, targets, bound.node, {}, &angles)) return false;
    for (const int axis : {0, 1, 2}) outputs[axis] = angles[axis] / radians_;
    return true;
  }

  double radians_;
};

}  // namespace

std::unique_ptr<NumberStep> MakeAim(Binder* binder) {
  auto step = std::make_unique<AimStep>(binder->measures().radians);
  binder->Begin(step.get());
  binder->Point("aimVector", &step->aim.aim);
  binder->Point("upVector", &step->aim.up);
  binder->Point("worldUpVector", &step->aim.worldUp);
  binder->Number("worldUpType", &step->upType);
  binder->MatrixOf("worldUpMatrix", &step->aim.upObject);
  binder->Point("offset", &step->aim.offset);
  binder->Number("twist", &step->aim.twist);
  binder->Point("constraintTranslate", &step->bound.node.translate);
  BindConstrainedNode(binder, &step->bound);
  const std::vector<std::int32_t> indices = TargetIndices(*binder);
  step->targets.resize(indices.size());
  for (std::size_t i = 0; i < indices.size(); ++i) BindTargetPoint(binder, indices[i], &step->targets[i]);
  if (step->aim.twist != 0.0) binder->ReportNode(diag::Code::TwistSign);
  return step;
}

}  // namespace motion

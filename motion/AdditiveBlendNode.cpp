// animBlendNodeAdditive and its variants for one number: the sum of two inputs, each times its weight.
#include "motion/NodeTypes.h"

namespace motion {
namespace {

class AdditiveBlend final : public NumberStep {
 public:
  double inputA = 0.0;
  double inputB = 0.0;
  double weightA = 1.0;
  double weightB = 1.0;
  double internalUnits = 1.0;

 private:
  bool Compute(double, double* outputs) override {
    outputs[0] = (inputA * weightA + inputB * weightB) / internalUnits;
    return true;
  }
};

}  // namespace

std::unique_ptr<NumberStep> MakeAdditiveBlend(Binder* binder) {
  auto step = std::make_unique<AdditiveBlend>();
  binder->Begin(step.get());
  binder->Internal("inputA", &step->inputA);
  binder->Internal("inputB", &step->inputB);
  binder->Number("weightA", &step->weightA);
  binder->Number("weightB", &step->weightB);
  const scene::Plug output = binder->scene().PlugOf(binder->node(), "output");
  step->internalUnits = InternalUnits(binder->measures(), KindOf(binder->scene(), output));
  return step;
}

}  // namespace motion

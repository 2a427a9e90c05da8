// unitConversion: its input times a factor.
#include "motion/NodeTypes.h"

namespace motion {
namespace {

class UnitConversion final : public NumberStep {
 public:
  double input = 0.0;
  double factor = 1.0;

 private:
  bool Compute(double, double* outputs) override {
    outputs[0] = input * factor;
    return true;
  }
};

}  // namespace

std::unique_ptr<NumberStep> MakeUnitConversion(Binder* binder) {
  auto step = std::make_unique<UnitConversion>();
  binder->Begin(step.get());
  binder->Internal("input", &step->input);
  binder->Number("conversionFactor", &step->factor);
  return step;
}

}  // namespace motion

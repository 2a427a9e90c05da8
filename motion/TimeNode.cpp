// time: the frame.
#include "motion/NodeTypes.h"

namespace motion {
namespace {

class Time final : public NumberStep {
  bool Compute(double frame, double* outputs) override {
    outputs[0] = frame;
    return true;
  }
};

}  // namespace

std::unique_ptr<NumberStep> MakeTime(Binder*) {
  auto step = std::make_unique<Time>();
  step->readsFrame = true;
  return step;
}

}  // namespace motion

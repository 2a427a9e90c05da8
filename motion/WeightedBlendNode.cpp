// blendWeighted: the sum of its inputs, each times its weight.
#include "motion/NodeTypes.h"

namespace motion {
namespace {

struct Share {
  double input = 0.0;
  double weight = 1.0;
};

class WeightedBlend final : public NumberStep {
 public:
  std::vector<Share> shares;

 private:
  bool Compute(double, double* outputs) override {
    outputs[0] = 0.0;
    for (const Share& share : shares) outputs[0] += share.input * share.weight;
    return true;
  }
};

}  // namespace

std::unique_ptr<NumberStep> MakeWeightedBlend(Binder* binder) {
  constexpr std::string_view kInputs[] = {"input"};
  auto step = std::make_unique<WeightedBlend>();
  binder->Begin(step.get());
  const std::vector<std::int32_t> indices = binder->Indices(kInputs);
  step->shares.resize(indices.size());
  for (std::size_t i = 0; i < indices.size(); ++i) {
    binder->Internal("input", &step->shares[i].input, indices[i]);
    binder->Number("weight", &step->shares[i].weight, indices[i]);
  }
  return step;
}

}  // namespace motion

// The order of an evaluator's steps: each after those that it reads. Connections in a circle are cut.
#include <tuple>

#include "motion/Evaluator.h"

namespace motion {

Ordering::Graph Evaluator::GraphOfSteps() {
  return {.inputCount =
              [this](std::uint32_t at) {
                return steps_[at]->numberInputs.size() + steps_[at]->matrixInputs.size();
              },
          .input = [this](std::uint32_t at, std::size_t input) { return StepOfInput(*steps_[at], input); },
          .place = [this](std::uint32_t at) { Place(at); },
          .placeCircle = [this](std::span<const std::uint32_t> circle) { CutCircle(circle); }};
}

void Evaluator::Order() {
  for (; ordered_ < steps_.size(); ++ordered_) ordering_.Place(static_cast<std::uint32_t>(ordered_));
  ReportFailures();
}

// The step that writes an input; matrix inputs count after the number inputs. kNone where no step writes it.
std::uint32_t Evaluator::StepOfInput(const Step& step, std::size_t input) const {
  const std::size_t numbers = step.numberInputs.size();
  if (input < numbers) return numbers_[static_cast<std::size_t>(step.numberInputs[input].cell)].step;
  return matrices_[static_cast<std::size_t>(step.matrixInputs[input - numbers].cell)].step;
}

// Every channel of the circle keeps its stored value. A circle always contains connections, because parents
// form no circles. It is reported once, at the first of its channels in the scene.
void Evaluator::CutCircle(std::span<const std::uint32_t> circle) {
  const scene::Plug* first = nullptr;
  const auto take = [&first](const scene::Plug& plug) {
    const auto key = [](const scene::Plug& one) { return std::tie(one.node, one.attribute, one.index); };
    if (first == nullptr || key(plug) < key(*first)) first = &plug;
  };
  for (const std::uint32_t at : circle) {
    if (!steps_[at]->Cut()) continue;
    const Written& written = written_[at];
    if (written.number != kNone) {
      Cell& cell = numbers_[written.number];
      if (IsInput(cell.plug)) continue;
      cell.standing = Standing::kCircle;
      take(cell.plug);
    } else {
      matrices_[written.matrix].standing = Standing::kCircle;
      take(matrices_[written.matrix].plug);
    }
  }
  if (first != nullptr) {
    diagnostics_->Report(diag::Code::DriverCircle, scene_.node(first->node).place, {NameOf(*first)});
  }
  ordering_.PlaceOpened(circle);
}

// Everything that the step reads is placed.
void Evaluator::Place(std::uint32_t at) {
  Step& step = *steps_[at];
  bool moves = step.readsFrame;
  for (std::size_t input = 0; input < step.numberInputs.size() + step.matrixInputs.size(); ++input) {
    const std::uint32_t before = StepOfInput(step, input);
    moves = moves || (before != kNone && moves_[before]);
  }
  moves_[at] = moves;
  placed_.push_back(at);
  if (moves) {
    moving_.push_back(at);
  } else {
    step.Run(&values_);
  }
}

}  // namespace motion

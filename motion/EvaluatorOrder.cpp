// The order of an evaluator's steps: each after those that it reads. A circle is cut where it closes.
#include <utility>

#include "motion/Evaluator.h"

namespace motion {

void Evaluator::Order() {
  for (; ordered_ < steps_.size(); ++ordered_) OrderFrom(static_cast<std::uint32_t>(ordered_));
  ReportFailures();
}

// The step that writes an input, counted from the numbers on; kNone where it is written once and for all.
std::uint32_t Evaluator::StepOfInput(const Step& step, std::size_t input) const {
  const std::size_t numbers = step.numberInputs.size();
  if (input < numbers) return numbers_[static_cast<std::size_t>(step.numberInputs[input].cell)].step;
  return matrices_[static_cast<std::size_t>(step.matrixInputs[input - numbers].cell)].step;
}

void Evaluator::OrderFrom(std::uint32_t root) {
  if (states_[root] != State::kNew) return;
  std::vector<std::pair<std::uint32_t, std::size_t>> open = {{root, 0}};  // steps and the next input of each
  states_[root] = State::kOpen;
  while (!open.empty()) {
    const std::uint32_t at = open.back().first;
    Step& step = *steps_[at];
    if (open.back().second == step.numberInputs.size() + step.matrixInputs.size()) {
      Place(at);
      open.pop_back();
      continue;
    }
    const std::size_t input = open.back().second++;
    const std::uint32_t before = StepOfInput(step, input);
    if (before == kNone || states_[before] == State::kPlaced) continue;
    if (states_[before] == State::kOpen) {
      CutCircle(&step, input);
      continue;
    }
    states_[before] = State::kOpen;
    open.push_back({before, 0});
  }
}

// Makes the input one that is not known, so that the next channel which the scene holds a value for keeps it.
void Evaluator::CutCircle(Step* step, std::size_t input) {
  scene::Plug plug;
  const std::size_t numbers = step->numberInputs.size();
  if (input < numbers) {
    NumberId& cell = step->numberInputs[input].cell;
    NumberCell& closing = numbers_[static_cast<std::size_t>(cell)];
    closing.standing = Standing::kCircle;
    plug = closing.plug;
    cell = static_cast<NumberId>(numbers_.size());
    numbers_.push_back({plug, kNone, Standing::kCircle});
    values_.numbers.push_back(StoredNumber(plug));
  } else {
    MatrixId& cell = step->matrixInputs[input - numbers].cell;
    MatrixCell& closing = matrices_[static_cast<std::size_t>(cell)];
    closing.standing = Standing::kCircle;
    plug = closing.plug;
    cell = static_cast<MatrixId>(matrices_.size());
    matrices_.push_back({plug, kNone, Standing::kCircle});
    values_.matrices.push_back(UnknownMatrix());
    locals_.push_back(nullptr);
  }
  diagnostics_->Report(diag::Code::DriverCircle, scene_.node(plug.node).place, {NameOf(plug)});
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
  states_[at] = State::kPlaced;
  if (moves) {
    moving_.push_back(at);
  } else {
    step.Run(&values_);
  }
}

}  // namespace motion

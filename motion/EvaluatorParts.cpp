// Divides what moves into parts that do not depend on each other. A sweep over all frames of one part after
// the other keeps its values in the processor's caches, however large the scene is.
#include <numeric>

#include "motion/Evaluator.h"

namespace motion {
namespace {

// Disjoint sets: joined things are in one group.
class Groups {
 public:
  explicit Groups(std::size_t count) : above_(count) { std::iota(above_.begin(), above_.end(), 0u); }

  std::uint32_t Of(std::uint32_t thing) {
    while (above_[thing] != thing) thing = above_[thing] = above_[above_[thing]];
    return thing;
  }
  void Join(std::uint32_t a, std::uint32_t b) { above_[Of(a)] = Of(b); }

 private:
  std::vector<std::uint32_t> above_;
};

}  // namespace

std::vector<std::uint32_t> Evaluator::Split(std::span<const Wanted> wanted) {
  Groups groups(steps_.size());
  const auto moves = [this](std::uint32_t step) { return step != kNone && moves_[step]; };
  for (const std::uint32_t at : moving_) {
    const Step& step = *steps_[at];
    for (std::size_t input = 0; input < step.numberInputs.size() + step.matrixInputs.size(); ++input) {
      const std::uint32_t before = StepOfInput(step, input);
      if (moves(before)) groups.Join(at, before);
    }
  }
  std::vector<std::uint32_t> first(wanted.size(), kNone);  // by set: a step of it that moves
  std::vector<bool> needed(steps_.size(), false);
  for (std::size_t set = 0; set < wanted.size(); ++set) {
    const auto take = [&](std::uint32_t step) {
      if (!moves(step)) return;
      needed[step] = true;
      if (first[set] == kNone) first[set] = step;
      groups.Join(step, first[set]);
    };
    for (const NumberId id : wanted[set].numbers) take(numbers_[static_cast<std::size_t>(id)].step);
    for (const MatrixId id : wanted[set].matrices) take(matrices_[static_cast<std::size_t>(id)].step);
  }
  std::vector<std::uint32_t> partOfGroup(steps_.size(), kStill);
  std::vector<std::uint32_t> parts(wanted.size(), kStill);
  parts_.assign(1, {});
  for (std::size_t set = 0; set < wanted.size(); ++set) {
    if (first[set] == kNone) continue;
    std::uint32_t& part = partOfGroup[groups.Of(first[set])];
    if (part == kStill) {
      part = static_cast<std::uint32_t>(parts_.size());
      parts_.emplace_back();
    }
    parts[set] = part;
  }
  // A step runs after those that it reads.
  for (auto at = moving_.rbegin(); at != moving_.rend(); ++at) {
    if (!needed[*at]) continue;
    const Step& step = *steps_[*at];
    for (std::size_t input = 0; input < step.numberInputs.size() + step.matrixInputs.size(); ++input) {
      const std::uint32_t before = StepOfInput(step, input);
      if (moves(before)) needed[before] = true;
    }
  }
  for (const std::uint32_t at : moving_) {
    const std::uint32_t part = partOfGroup[groups.Of(at)];
    if (part != kStill && needed[at]) parts_[part].push_back(at);
  }
  return parts;
}

void Evaluator::MoveTo(double frame, std::uint32_t part) {
  values_.frame = frame;
  for (const std::uint32_t step : parts_[part]) steps_[step]->Run(&values_);
  if (!values_.failed.empty()) ReportFailures();
}

}  // namespace motion

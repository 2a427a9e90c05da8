#include "motion/KeptBelow.h"

#include <algorithm>
#include <optional>

#include "diag/Diagnostic.h"

namespace motion {

KeptBelow::KeptBelow(const Evaluator& evaluator)
    : evaluator_(evaluator), listOfStep_(evaluator.steps_.size(), 0), lists_(1) {
  for (const std::uint32_t at : evaluator.placed_) listOfStep_[at] = ListBelow(*evaluator.steps_[at]);
}

// The list of a step: the lists of its inputs together. Where only one input has a list, that list is shared.
std::uint32_t KeptBelow::ListBelow(const Step& step) {
  std::uint32_t only = 0;
  bool several = false;
  const auto look = [&](const auto& cell) {
    const std::uint32_t list = cell.step == Evaluator::kNone ? 0 : listOfStep_[cell.step];
    several = several || !cell.AsDriven() || (list != 0 && only != 0 && list != only);
    if (list != 0) only = list;
  };
  for (const NumberInput& input : step.numberInputs) look(evaluator_.CellOf(input.cell));
  for (const MatrixInput& input : step.matrixInputs) look(evaluator_.CellOf(input.cell));
  if (!several) return only;
  std::vector<Kept> kept;
  for (const NumberInput& input : step.numberInputs) Take(input.cell, &kept);
  for (const MatrixInput& input : step.matrixInputs) Take(input.cell, &kept);
  lists_.push_back(std::move(kept));
  return static_cast<std::uint32_t>(lists_.size() - 1);
}

void KeptBelow::Merge(const std::vector<Kept>& more, std::vector<Kept>* kept) {
  for (const Kept& one : more) {
    if (kept->size() == kMost) return;
    const bool known =
        std::any_of(kept->begin(), kept->end(), [&one](const Kept& other) { return other.plug == one.plug; });
    if (!known) kept->push_back(one);
  }
}

template <typename Cell>
void KeptBelow::TakeCell(const Cell& cell, std::vector<Kept>* kept) const {
  if (!cell.AsDriven()) Merge({{cell.plug, cell.standing}}, kept);
  if (cell.step != Evaluator::kNone) Merge(lists_[listOfStep_[cell.step]], kept);
}

void KeptBelow::Take(NumberId number, std::vector<Kept>* kept) const {
  TakeCell(evaluator_.CellOf(number), kept);
}
void KeptBelow::Take(MatrixId matrix, std::vector<Kept>* kept) const {
  TakeCell(evaluator_.CellOf(matrix), kept);
}

std::vector<Kept> KeptBelow::Of(const std::vector<NumberId>& numbers,
                                const std::vector<MatrixId>& matrices) const {
  std::vector<Kept> kept;
  for (const NumberId number : numbers) Take(number, &kept);
  for (const MatrixId matrix : matrices) Take(matrix, &kept);
  return kept;
}

std::string SentenceOf(const Evaluator& evaluator, const Kept& kept) {
  const std::optional<scene::Driver> driver = evaluator.scene().SourceOf(kept.plug);
  switch (kept.standing) {
    case Standing::kUnsupported:
      return driver ? diag::SentenceOf({.code = diag::Code::UnsupportedDriver,
                                        .arguments = evaluator.NamesOfDriver(kept.plug, *driver)})
                    : "";
    case Standing::kFailed:
      return driver ? diag::SentenceOf({.code = diag::Code::DriverWithoutAnswer,
                                        .arguments = evaluator.NamesOfDriver(kept.plug, *driver)})
                    : "";
    default:
      return diag::SentenceOf({.code = diag::Code::DriverCircle, .arguments = {evaluator.NameOf(kept.plug)}});
  }
}

}  // namespace motion

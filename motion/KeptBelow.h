// What of all that a value depends on does not have the value that drives it.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "motion/Evaluator.h"

namespace motion {

// One pass over all that an evaluator computes; afterwards a question costs no more than what is asked. What
// a value depends on is counted up to kMost: a rig of thousands of unsupported nodes says so by a few of
// them.
class KeptBelow {
 public:
  static constexpr std::size_t kMost = 8;

  // As things stand now: a driver that has no answer at some frame is known after that frame. The evaluator
  // must outlive it.
  explicit KeptBelow(const Evaluator& evaluator);

  // Each once, at most kMost.
  std::vector<Kept> Of(const std::vector<NumberId>& numbers, const std::vector<MatrixId>& matrices) const;

  // Adds those that are not there yet, up to kMost in all.
  static void Merge(const std::vector<Kept>& more, std::vector<Kept>* kept);

 private:
  void Take(NumberId number, std::vector<Kept>* kept) const;
  void Take(MatrixId matrix, std::vector<Kept>* kept) const;
  template <typename Cell>
  void TakeCell(const Cell& cell, std::vector<Kept>* kept) const;
  std::uint32_t ListBelow(const Step& step);

  const Evaluator& evaluator_;
  std::vector<std::uint32_t> listOfStep_;  // of what is kept below a step: 0 is nothing
  std::vector<std::vector<Kept>> lists_;
};

// What is said of it: the sentence of its diagnostic.
std::string SentenceOf(const Evaluator& evaluator, const Kept& kept);

}  // namespace motion

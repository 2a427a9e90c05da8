// Finds the channels that keep their stored value among all that a value depends on.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "motion/Evaluator.h"

namespace motion {

// Makes one pass over all that an evaluator computes; afterwards a call costs no more than its arguments. At
// most kMost channels are kept for a value: of a rig with thousands of unsupported nodes a few are enough.
class KeptBelow {
 public:
  static constexpr std::size_t kMost = 8;

  // The evaluator must outlive it. A driver without a value at some frame is known only after that frame, so
  // this comes after all frames.
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
  std::vector<std::uint32_t> listOfStep_;  // the index in lists_ of what is kept below a step; 0: nothing
  std::vector<std::vector<Kept>> lists_;
};

// The sentence of its diagnostic.
std::string SentenceOf(const Evaluator& evaluator, const Kept& kept);

}  // namespace motion

#include "motion/Ordering.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <set>
#include <vector>

#include "tests/motion/Chance.h"

namespace {

using motion::Ordering;

// Steps that read others, and what came of their order.
class Steps {
 public:
  explicit Steps(std::vector<std::vector<std::uint32_t>> reads)
      : reads_(std::move(reads)),
        placed_(reads_.size(), false),
        ordering_({.inputCount = [this](std::uint32_t step) { return reads_[step].size(); },
                   .input = [this](std::uint32_t step, std::size_t input) { return reads_[step][input]; },
                   .place =
                       [this](std::uint32_t step) {
                         EXPECT_FALSE(placed_[step]) << step;
                         placed_[step] = true;
                         for (const std::uint32_t read : reads_[step]) {
                           EXPECT_TRUE(read == Ordering::kNone || placed_[read]) << step << " reads " << read;
                         }
                       },
                   .placeCircle =
                       [this](std::span<const std::uint32_t> circle) {
                         circles_.insert({circle.begin(), circle.end()});
                         for (const std::uint32_t step : circle) Open(step, circle);
                         ordering_.PlaceOpened(circle);
                       }}) {}

  void Place(std::uint32_t step) { ordering_.Place(step); }
  bool AllPlaced() const { return std::find(placed_.begin(), placed_.end(), false) == placed_.end(); }
  const std::set<std::set<std::uint32_t>>& circles() const { return circles_; }

 private:
  // Takes away what the step reads of its circle.
  void Open(std::uint32_t step, std::span<const std::uint32_t> circle) {
    for (std::uint32_t& read : reads_[step]) {
      if (std::find(circle.begin(), circle.end(), read) != circle.end()) read = Ordering::kNone;
    }
  }

  std::vector<std::vector<std::uint32_t>> reads_;
  std::vector<bool> placed_;
  std::set<std::set<std::uint32_t>> circles_;
  Ordering ordering_;
};

TEST(OrderingTest, AStepComesAfterThoseThatItReads) {
  Steps steps({{1, 2}, {3}, {3, Ordering::kNone}, {}});
  steps.Place(0);
  EXPECT_TRUE(steps.AllPlaced());
  EXPECT_TRUE(steps.circles().empty());
}

TEST(OrderingTest, AStepThatReadsItselfIsACircle) {
  Steps steps({{0}, {0}});
  steps.Place(1);
  EXPECT_TRUE(steps.AllPlaced());
  EXPECT_EQ(steps.circles(), (std::set<std::set<std::uint32_t>>{{0}}));
}

// The steps that a step leads to.
std::set<std::uint32_t> LedToBy(std::uint32_t step, const std::vector<std::vector<std::uint32_t>>& reads) {
  std::set<std::uint32_t> reached;
  std::vector<std::uint32_t> open = reads[step];
  while (!open.empty()) {
    const std::uint32_t at = open.back();
    open.pop_back();
    if (reached.insert(at).second) open.insert(open.end(), reads[at].begin(), reads[at].end());
  }
  return reached;
}

std::set<std::set<std::uint32_t>> CirclesOf(const std::vector<std::vector<std::uint32_t>>& reads) {
  std::set<std::set<std::uint32_t>> circles;
  for (std::uint32_t step = 0; step < reads.size(); ++step) {
    const std::set<std::uint32_t> from = LedToBy(step, reads);
    if (from.count(step) == 0) continue;
    std::set<std::uint32_t> circle;
    for (const std::uint32_t other : from) {
      if (LedToBy(other, reads).count(step) != 0) circle.insert(other);
    }
    circles.insert(circle);
  }
  return circles;
}

TEST(OrderingTest, CirclesAreThoseThatLeadToOneAnotherWhereverTheWalkBegins) {
  testmotion::Chance chance(7);
  for (int graph = 0; graph < 300; ++graph) {
    constexpr int kSteps = 12;
    std::vector<std::vector<std::uint32_t>> reads(kSteps);
    for (auto& inputs : reads) {
      for (int count = chance.Below(3); count != 0; --count) {
        inputs.push_back(static_cast<std::uint32_t>(chance.Below(kSteps)));
      }
    }
    for (const std::uint32_t start : {0u, 5u, 11u}) {
      Steps steps(reads);
      for (std::uint32_t i = 0; i < kSteps; ++i) steps.Place((start + i) % kSteps);
      ASSERT_TRUE(steps.AllPlaced());
      ASSERT_EQ(steps.circles(), CirclesOf(reads)) << graph;
    }
  }
}

TEST(OrderingTest, ALongWayTakesNoDepth) {
  constexpr std::uint32_t kSteps = 300000;
  std::vector<std::vector<std::uint32_t>> reads(kSteps);
  for (std::uint32_t step = 0; step + 1 < kSteps; ++step) reads[step] = {step + 1};
  Steps steps(std::move(reads));
  steps.Place(0);
  EXPECT_TRUE(steps.AllPlaced());
}

}  // namespace

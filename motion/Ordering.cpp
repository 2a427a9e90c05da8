#include "motion/Ordering.h"

#include <algorithm>

namespace motion {

Ordering::Mark& Ordering::MarkOf(std::uint32_t step) {
  if (marks_.size() <= step) marks_.resize(std::max<std::size_t>(step + std::size_t{1}, marks_.size() * 2));
  return marks_[step];
}

// Tarjan's algorithm for strongly connected components, without recursion: sets of steps that all lead to one
// another come after those that they lead to.
void Ordering::Place(std::uint32_t step) {
  if (MarkOf(step).state != State::kNew) return;
  Walk walk;
  Enter(step, &walk);
  while (!walk.way.empty()) {
    const std::uint32_t at = walk.way.back().first;
    if (walk.way.back().second == graph_.inputCount(at)) {
      Leave(at, &walk);
    } else {
      Follow(at, graph_.input(at, walk.way.back().second++), &walk);
    }
  }
}

void Ordering::Enter(std::uint32_t step, Walk* walk) {
  MarkOf(step) = {State::kOpen, false, entered_, entered_};
  ++entered_;
  walk->way.emplace_back(step, 0);
  walk->open.push_back(step);
}

void Ordering::Follow(std::uint32_t from, std::uint32_t to, Walk* walk) {
  if (to == kNone) return;
  const Mark reached = MarkOf(to);
  if (reached.state == State::kNew) return Enter(to, walk);
  if (reached.state != State::kOpen) return;
  Mark& mark = MarkOf(from);
  mark.lowest = std::min(mark.lowest, reached.entered);
  mark.readsItself = mark.readsItself || from == to;
}

void Ordering::Leave(std::uint32_t step, Walk* walk) {
  const Mark mark = MarkOf(step);
  walk->way.pop_back();
  if (mark.lowest != mark.entered) {
    // Not the first of its set: that one is further up on the way.
    Mark& above = MarkOf(walk->way.back().first);
    above.lowest = std::min(above.lowest, mark.lowest);
    return;
  }
  auto first = walk->open.end();
  do MarkOf(*--first).state = State::kPlaced;
  while (*first != step);
  const std::vector<std::uint32_t> set(first, walk->open.end());
  walk->open.erase(first, walk->open.end());
  const bool circle = set.size() > 1 || mark.readsItself;
  if (circle && !opening_) return graph_.placeCircle(set);
  for (const std::uint32_t one : set) graph_.place(one);
}

void Ordering::PlaceOpened(std::span<const std::uint32_t> circle) {
  opening_ = true;
  for (const std::uint32_t step : circle) MarkOf(step).state = State::kNew;
  for (const std::uint32_t step : circle) Place(step);
  opening_ = false;
}

}  // namespace motion

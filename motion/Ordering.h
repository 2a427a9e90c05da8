// Puts steps into an order in which each comes after those that it reads.
#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <span>
#include <utility>
#include <vector>

namespace motion {

// Steps are numbers from 0 on. Each is placed once, after all that it reads. Steps that lead back to one
// another are placed together, as a circle; they are the same ones whichever step is asked for first. Time
// and memory grow with the steps and what they read; nothing is recursive.
class Ordering {
 public:
  static constexpr std::uint32_t kNone = 0xffffffff;

  struct Graph {
    // How many inputs a step has, and which step writes one of them; kNone where none does.
    std::function<std::size_t(std::uint32_t)> inputCount;
    std::function<std::uint32_t(std::uint32_t, std::size_t)> input;
    // Called for a step that is on no circle, and for all those of a circle, in no order of meaning.
    std::function<void(std::uint32_t)> place;
    std::function<void(std::span<const std::uint32_t>)> placeCircle;
  };

  explicit Ordering(Graph graph) : graph_(std::move(graph)) {}

  // Places the step, and before it all that it reads; what is placed already stays.
  void Place(std::uint32_t step);

  // Places the steps of a circle again, after some of their inputs were removed. For placeCircle. Leaving a
  // circle is an error of the caller: its steps are then placed in any order.
  void PlaceOpened(std::span<const std::uint32_t> circle);

 private:
  enum class State : std::uint8_t { kNew, kOpen, kPlaced };
  struct Mark {
    State state = State::kNew;
    bool readsItself = false;
    std::uint32_t entered = 0;  // when, counted from 0
    std::uint32_t lowest = 0;   // the first one entered to which it leads back
  };
  // Steps on the way down, with the next input of each; and those entered whose set is not known yet.
  struct Walk {
    std::vector<std::pair<std::uint32_t, std::size_t>> way;
    std::vector<std::uint32_t> open;
  };

  Mark& MarkOf(std::uint32_t step);
  void Enter(std::uint32_t step, Walk* walk);
  void Follow(std::uint32_t from, std::uint32_t to, Walk* walk);
  void Leave(std::uint32_t step, Walk* walk);

  Graph graph_;
  std::vector<Mark> marks_;
  std::uint32_t entered_ = 0;
  bool opening_ = false;
};

}  // namespace motion

// Chance that is the same everywhere for the same seed.
#pragma once

#include <cstddef>
#include <cstdint>
#include <iterator>

#include "tests/support/SplitMix.h"

namespace secondreader {

class Dice {
 public:
  explicit Dice(std::uint64_t seed) : state_(seed) {}

  std::uint64_t next() { return testsupport::SplitMix(&state_); }

  std::size_t below(std::size_t bound) { return static_cast<std::size_t>(next() % bound); }
  // Both ends included.
  int between(int least, int most) {
    return least + static_cast<int>(below(static_cast<std::size_t>(most - least) + 1));
  }
  bool chance(int percent) { return between(1, 100) <= percent; }

  template <typename Choices>
  const auto& oneOf(const Choices& choices) {
    return *std::next(std::begin(choices), static_cast<std::ptrdiff_t>(below(std::size(choices))));
  }

 private:
  std::uint64_t state_;
};

}  // namespace secondreader

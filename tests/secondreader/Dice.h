// Chance that is the same everywhere for the same seed.
#pragma once

#include <cstddef>
#include <cstdint>
#include <iterator>

namespace secondreader {

class Dice {
 public:
  explicit Dice(std::uint64_t seed) : state_(seed) {}

  // The steps of SplitMix64.
  std::uint64_t next() {
    state_ += 0x9e3779b97f4a7c15u;
    std::uint64_t mixed = state_;
    mixed = (mixed ^ (mixed >> 30)) * 0xbf58476d1ce4e5b9u;
    mixed = (mixed ^ (mixed >> 27)) * 0x94d049bb133111ebu;
    return mixed ^ (mixed >> 31);
  }

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

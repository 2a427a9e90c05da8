// Numbers by chance, the same on every platform for the same seed.
#pragma once

#include <cstdint>

#include "motion/Matrix.h"
#include "tests/support/SplitMix.h"

namespace testmotion {

class Chance {
 public:
  explicit Chance(std::uint64_t seed) : state_(seed) {}

  double Between(double low, double high) {
    constexpr double kUnit = 0x1p-53;
    return low + (high - low) * static_cast<double>(testsupport::SplitMix(&state_) >> 11) * kUnit;
  }
  int Below(int count) {
    return static_cast<int>(testsupport::SplitMix(&state_) % static_cast<unsigned>(count));
  }
  bool OneIn(int count) { return Below(count) == 0; }
  template <typename T, std::size_t kCount>
  const T& Of(const T (&choices)[kCount]) {
    return choices[Below(static_cast<int>(kCount))];
  }
  motion::Vector Point(double size) {
    const double x = Between(-size, size);
    const double y = Between(-size, size);
    return {x, y, Between(-size, size)};
  }

 private:
  std::uint64_t state_;
};

}  // namespace testmotion

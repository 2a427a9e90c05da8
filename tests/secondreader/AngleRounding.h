// How well the values of a turned node are known.
#pragma once

#include <algorithm>
#include <cmath>

#include "tests/secondreader/Records.h"
#include "tests/secondreader/TraceComparison.h"

namespace secondreader {

// Of scale and position: a node that is not turned meets no sine.
inline Rounding roundingAfter(const Triple& rotate) {
  return rotate == Triple{} ? Rounding::None : Rounding::Last;
}

// Of the angles of one stream, in radians, one after the other. Where the last digits decide on which side of
// half a turn an angle lies, a whole turn more or less is as good from there on.
class AngleRounding {
 public:
  Rounding first(double angle) { return seen(angle); }
  Rounding next(double angle, double previous) { return seen(angle - previous); }

 private:
  Rounding seen(double difference) {
    constexpr double kHalf = 3.141592653589793;
    constexpr double kNear = 1e-9;
    open_ = open_ || kHalf - std::fabs(std::remainder(difference, 2.0 * kHalf)) < kNear;
    return open_ ? Rounding::HalfTurn : Rounding::Angle;
  }

  bool open_ = false;
};

}  // namespace secondreader

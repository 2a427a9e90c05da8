// The part of a curve between two neighbouring keys, prepared for many evaluations.
#pragma once

#include <cstddef>

#include "motion/CurveData.h"

namespace motion {

class CurveSpan {
 public:
  CurveSpan() = default;
  // The span from `key` to the next one. The keys are in strictly ascending order.
  CurveSpan(const CurveData& curve, std::size_t key);

  // The value at a time inside the span.
  double At(double time) const;

 private:
  enum class Shape { kLevel, kCubic, kBezier };

  void SetLevel(double value);
  void SetCubic(const CurveData& curve, std::size_t key);
  void SetBezier(const CurveData& curve, std::size_t key);
  void SetValues(double from, double to, double rise, double fall);
  double SolveTime(double share) const;

  Shape shape_ = Shape::kLevel;
  double start_ = 0.0;
  double length_ = 1.0;
  double values_[4] = {};  // of the polynomial in u, lowest power first
  double times_[3] = {};   // of the polynomial that gives the share of the time by u, from the first power on
};

}  // namespace motion

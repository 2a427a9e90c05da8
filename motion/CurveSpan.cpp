#include "motion/CurveSpan.h"

#include <algorithm>
#include <cmath>

#include "motion/CurveTangents.h"

namespace motion {
namespace {

constexpr double kThird = 1.0 / 3.0;
constexpr double kAtThirds = 1e-6;     // nearer handles than this count as lying at a third
constexpr double kInsideEdge = 1e-10;  // a moved handle lies this far inside the edge
constexpr double kFarthest = 4.0 / 3.0;

// A handle of a weighted tangent: how far it lies from its key, in time as a share of the span, and in value.
struct Handle {
  double reach;
  double rise;
};

Handle HandleOf(const Tangent& tangent, double length) { return {tangent.x / 3.0 / length, tangent.y / 3.0}; }

// Moved in time, a handle keeps its slope.
void MoveTo(double reach, const Tangent& tangent, double length, Handle* handle) {
  if (reach == handle->reach) return;
  *handle = {reach, Slope(tangent) * reach * length};
}

// Where a handle lies outside the span, the curve can run back in time. It does not when X and Y, the reaches
// of the two handles, are inside the ellipse X² + Y² + XY - 2X - 2Y + 1 = 0. Keeps X where possible, and
// moves Y to the nearer edge.
void MakeMonotone(double* x, double* y) {
  if (*x >= kFarthest) {
    *x = kFarthest;
    *y = kThird;
    return;
  }
  const double middle = (2.0 - *x) / 2.0;
  const double half = std::sqrt(*x * (4.0 - 3.0 * *x)) / 2.0;
  if (*y > middle + half) {
    *y = middle + half - kInsideEdge;
  } else if (*y < middle - half) {
    *y = middle - half + kInsideEdge;
  }
}

bool AtThird(const Handle& handle) { return std::fabs(handle.reach - kThird) < kAtThirds; }

}  // namespace

CurveSpan::CurveSpan(const CurveData& curve, std::size_t key)
    : start_(curve.keys[key].time), length_(curve.keys[key + 1].time - curve.keys[key].time) {
  const double from = curve.keys[key].value;
  const double to = curve.keys[key + 1].value;
  const std::uint8_t out = TangentType(curve, Side::kOut, key);
  const std::uint8_t in = TangentType(curve, Side::kIn, key + 1);
  if (out == tangent::kStep) {
    SetLevel(from);
  } else if (out == tangent::kStepNext) {
    SetLevel(to);
  } else if (out == tangent::kLinear && in == tangent::kLinear) {
    shape_ = Shape::kCubic;
    values_[0] = from;
    values_[1] = to - from;
  } else if (curve.weighted) {
    SetBezier(curve, key);
  } else {
    SetCubic(curve, key);
  }
}

void CurveSpan::SetLevel(double value) {
  shape_ = Shape::kLevel;
  values_[0] = value;
}

// The Bezier polynomial of the values; `rise` leads from the first one to its handle, `fall` from the second
// handle to its value.
void CurveSpan::SetValues(double from, double to, double rise, double fall) {
  const double difference = to - from;
  values_[0] = from;
  values_[1] = 3.0 * rise;
  values_[2] = 3.0 * (difference - fall - 2.0 * rise);
  values_[3] = 3.0 * (rise + fall) - 2.0 * difference;
}

void CurveSpan::SetCubic(const CurveData& curve, std::size_t key) {
  shape_ = Shape::kCubic;
  const double third = length_ * kThird;
  SetValues(curve.keys[key].value, curve.keys[key + 1].value,
            Slope(TangentAt(curve, Side::kOut, key)) * third,
            Slope(TangentAt(curve, Side::kIn, key + 1)) * third);
}

void CurveSpan::SetBezier(const CurveData& curve, std::size_t key) {
  const Tangent out = TangentAt(curve, Side::kOut, key);
  const Tangent in = TangentAt(curve, Side::kIn, key + 1);
  Handle left = HandleOf(out, length_);
  Handle right = HandleOf(in, length_);
  double x = std::max(left.reach, 0.0);
  double y = std::max(right.reach, 0.0);
  if (x > 1.0 || y > 1.0) MakeMonotone(&x, &y);
  MoveTo(x, out, length_, &left);
  MoveTo(y, in, length_, &right);
  SetValues(curve.keys[key].value, curve.keys[key + 1].value, left.rise, right.rise);
  shape_ = AtThird(left) && AtThird(right) ? Shape::kCubic : Shape::kBezier;
  const double second = 1.0 - right.reach;
  times_[0] = 3.0 * left.reach;
  times_[1] = 3.0 * (second - 2.0 * left.reach);
  times_[2] = 1.0 + 3.0 * (left.reach - second);
}

// The u at which that share of the time has passed; the share grows with u. Takes Newton steps, and halves
// the interval where a step leaves it or gains too little.
double CurveSpan::SolveTime(double share) const {
  constexpr int kMostSteps = 200;
  double low = 0.0;
  double high = 1.0;
  double u = share;
  double lastStep = 1.0;
  for (int step = 0; step < kMostSteps; ++step) {
    const double error = u * (times_[0] + u * (times_[1] + u * times_[2])) - share;
    if (error == 0.0) return u;
    (error < 0.0 ? low : high) = u;
    const double speed = times_[0] + u * (2.0 * times_[1] + u * 3.0 * times_[2]);
    double next = u - error / speed;
    const bool inside = next > low && next < high;  // not so where the speed is 0
    if (!inside || std::fabs(next - u) > 0.5 * lastStep) next = low + 0.5 * (high - low);
    lastStep = std::fabs(next - u);
    if (next == u || next == low || next == high) return next;
    u = next;
  }
  return u;
}

double CurveSpan::At(double time) const {
  if (shape_ == Shape::kLevel) return values_[0];
  const double share = (time - start_) / length_;
  const double u = shape_ == Shape::kBezier ? SolveTime(share) : share;
  return values_[0] + u * (values_[1] + u * (values_[2] + u * values_[3]));
}

}  // namespace motion

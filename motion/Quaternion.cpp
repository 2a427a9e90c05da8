#include "motion/Quaternion.h"

#include <algorithm>
#include <cmath>

namespace motion {
namespace {

struct Quaternion {
  double w;
  Vector v;
};

double Dot(const Quaternion& a, const Quaternion& b) { return a.w * b.w + motion::Dot(a.v, b.v); }

// Starts from the largest of the four, which is never small.
Quaternion Of(const Matrix& m) {
  const double trace = m.x.x + m.y.y + m.z.z;
  int largest = 0;
  for (const int axis : {1, 2}) {
    if (m.Axis(axis)[axis] > m.Axis(largest)[largest]) largest = axis;
  }
  const double diagonal = m.Axis(largest)[largest];
  if (trace > diagonal) {
    const double w = std::sqrt(std::max(0.0, 1.0 + trace)) / 2.0;
    const double share = 0.25 / w;
    return {w, Vector{m.y.z - m.z.y, m.z.x - m.x.z, m.x.y - m.y.x} * share};
  }
  const int second = (largest + 1) % 3;
  const int third = (largest + 2) % 3;
  const double value = std::sqrt(std::max(0.0, 1.0 + 2.0 * diagonal - trace)) / 2.0;
  const double share = 0.25 / value;
  Quaternion q{};
  q.v[largest] = value;
  q.v[second] = (m.Axis(largest)[second] + m.Axis(second)[largest]) * share;
  q.v[third] = (m.Axis(largest)[third] + m.Axis(third)[largest]) * share;
  q.w = (m.Axis(second)[third] - m.Axis(third)[second]) * share;
  return q;
}

Matrix MatrixOf(const Quaternion& q) {
  const auto [x, y, z] = q.v;
  const double w = q.w;
  return {{1.0 - 2.0 * (y * y + z * z), 2.0 * (x * y + w * z), 2.0 * (x * z - w * y)},
          {2.0 * (x * y - w * z), 1.0 - 2.0 * (x * x + z * z), 2.0 * (y * z + w * x)},
          {2.0 * (x * z + w * y), 2.0 * (y * z - w * x), 1.0 - 2.0 * (x * x + y * y)},
          {}};
}

}  // namespace

Matrix MixRotations(const Matrix& from, const Matrix& to, double share) {
  const Quaternion a = Of(from);
  Quaternion b = Of(to);
  double cosine = Dot(a, b);
  if (cosine < 0.0) {
    b = {-b.w, -b.v};
    cosine = -cosine;
  }
  const double angle = std::acos(std::min(cosine, 1.0));
  const double sine = std::sin(angle);
  constexpr double kStraight = 1e-9;
  const double first = sine < kStraight ? 1.0 - share : std::sin((1.0 - share) * angle) / sine;
  const double second = sine < kStraight ? share : std::sin(share * angle) / sine;
  Quaternion mixed{first * a.w + second * b.w, a.v * first + b.v * second};
  const double length = std::sqrt(Dot(mixed, mixed));
  if (!(length > 0.0)) return from;
  return MatrixOf({mixed.w / length, mixed.v * (1.0 / length)});
}

}  // namespace motion

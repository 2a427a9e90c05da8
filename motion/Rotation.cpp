#include "motion/Rotation.h"

#include <cmath>

namespace motion {
namespace {

constexpr double kPi = 3.141592653589793;
constexpr double kTurn = 2.0 * kPi;
constexpr double kPole = 1e-9;  // the cosine of the second angle below which the others are not separable

// The axes in the order of their rotations; the sign is 1 when they follow each other as x, y, z do, else -1.
struct Turns {
  int first;
  int second;
  int third;
  double sign;
};

Turns TurnsOf(RotateOrder order) {
  switch (order) {
    case RotateOrder::kYZX:
      return {1, 2, 0, 1.0};
    case RotateOrder::kZXY:
      return {2, 0, 1, 1.0};
    case RotateOrder::kXZY:
      return {0, 2, 1, -1.0};
    case RotateOrder::kYXZ:
      return {1, 0, 2, -1.0};
    case RotateOrder::kZYX:
      return {2, 1, 0, -1.0};
    case RotateOrder::kXYZ:
      break;
  }
  return {0, 1, 2, 1.0};
}

double NearestTurn(double angle, double near) {
  const double turns = std::round((near - angle) / kTurn);
  return std::isfinite(turns) ? angle + turns * kTurn : angle;
}

Vector NearestTurns(const Vector& angles, const Vector& near) {
  return {NearestTurn(angles.x, near.x), NearestTurn(angles.y, near.y), NearestTurn(angles.z, near.z)};
}

double Distance(const Vector& a, const Vector& b) {
  return std::fabs(a.x - b.x) + std::fabs(a.y - b.y) + std::fabs(a.z - b.z);
}

}  // namespace

RotateOrder RotateOrderOf(int code) {
  return code < 0 || code > 5 ? RotateOrder::kXYZ : static_cast<RotateOrder>(code);
}

Matrix RotationAbout(int axis, double angle) {
  const int second = (axis + 1) % 3;
  const int third = (axis + 2) % 3;
  const double cosine = std::cos(angle);
  const double sine = std::sin(angle);
  Matrix matrix;
  matrix.Axis(second)[second] = cosine;
  matrix.Axis(second)[third] = sine;
  matrix.Axis(third)[second] = -sine;
  matrix.Axis(third)[third] = cosine;
  return matrix;
}

Matrix RotationMatrix(const Vector& angles, RotateOrder order) {
  const Turns turns = TurnsOf(order);
  return RotationAbout(turns.first, angles[turns.first]) * RotationAbout(turns.second, angles[turns.second]) *
         RotationAbout(turns.third, angles[turns.third]);
}

// With a, b, c the angles in the order of the rotations, the first row is (cos b cos c, cos b sin c, -sin b).
// The third angle follows from it, and the others from what is left when that rotation is undone. So the
// three fit each other near the pole too, where each of them is uncertain.
Vector AnglesOf(const Matrix& rotation, RotateOrder order, const Vector& near) {
  const auto [i, j, k, sign] = TurnsOf(order);
  const auto at = [&rotation](int row, int column) { return rotation.Axis(row)[column]; };
  const bool pole = std::hypot(at(i, i), at(i, j)) < kPole;
  const double third = pole ? sign * near[k] : std::atan2(at(i, j), at(i, i));
  const double cosine = std::cos(third);
  const double sine = std::sin(third);
  const double second = std::atan2(-at(i, k), at(i, i) * cosine + at(i, j) * sine);
  const double first = std::atan2(at(k, i) * sine - at(k, j) * cosine, at(j, j) * cosine - at(j, i) * sine);
  Vector angles;
  angles[i] = sign * first;
  angles[j] = sign * second;
  angles[k] = sign * third;
  return angles;
}

Vector NearestAngles(const Vector& angles, RotateOrder order, const Vector& near) {
  const Turns turns = TurnsOf(order);
  Vector other = angles;
  other[turns.first] += kPi;
  other[turns.second] = kPi - other[turns.second];
  other[turns.third] += kPi;
  const Vector same = NearestTurns(angles, near);
  const Vector flipped = NearestTurns(other, near);
  return Distance(flipped, near) < Distance(same, near) ? flipped : same;
}

}  // namespace motion

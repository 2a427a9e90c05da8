#include "tests/secondreader/Matrices.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace secondreader {
namespace {

constexpr std::size_t kAxes = 3;

// Below this cosine Y counts as a quarter turn.
constexpr double kQuarterTurn = 1e-9;

// The axes of a rotation, as columns of length 1; (0, 0, 0) where one is missing.
using Axes = std::array<Triple, kAxes>;

bool isMissing(const Triple& axis) { return axis == Triple{}; }

// A zero without a sign, which would choose between the two ways of half a turn.
double unsignedZero(double value) { return value == 0.0 ? 0.0 : value; }

// The angle from the first direction towards the second.
double angle(double along, double across) { return std::atan2(unsignedZero(across), unsignedZero(along)); }

// Its length is taken out of the axis, and given.
double takeLength(Triple* axis) {
  const double largest = std::max({std::fabs((*axis)[0]), std::fabs((*axis)[1]), std::fabs((*axis)[2])});
  if (largest == 0.0) return 0.0;
  double squares = 0.0;
  for (double& component : *axis) {
    component /= largest;
    squares += component * component;
  }
  for (double& component : *axis) component /= std::sqrt(squares);
  return std::min(largest * std::sqrt(squares), std::numeric_limits<double>::max());
}

Triple cross(const Triple& a, const Triple& b) {
  return {a[1] * b[2] - a[2] * b[1], a[2] * b[0] - a[0] * b[2], a[0] * b[1] - a[1] * b[0]};
}

double dot(const Triple& a, const Triple& b) { return a[0] * b[0] + a[1] * b[1] + a[2] * b[2]; }

// Z and Y carry the X axis (1, 0, 0) to where it is; X is the turn that is left when both are taken back.
Triple anglesOf(const Axes& axes) {
  const auto& [x, y, z] = axes;
  const double level = std::hypot(x[0], x[1]);
  const bool quarter = level < kQuarterTurn;
  const double turnZ = quarter ? 0.0 : angle(x[0], x[1]);
  const double c = quarter ? 1.0 : x[0] / level;
  const double s = quarter ? 0.0 : x[1] / level;
  return {angle(c * y[1] - s * y[0], s * z[0] - c * z[1]), angle(level, -x[2]), turnZ};
}

// The only axis that is there: the angles that carry its coordinate axis to it. X does not move the X axis,
// Y not the Y axis, Z not the Z axis: that one is 0.
Triple anglesOfOne(std::size_t known, const Triple& axis) {
  if (known == 0) {
    // (cos z cos y, sin z cos y, -sin y)
    const double level = std::hypot(axis[0], axis[1]);
    const double turnZ = level < kQuarterTurn ? 0.0 : angle(axis[0], axis[1]);
    return {0.0, angle(level, -axis[2]), turnZ};
  }
  if (known == 1) {
    // (-sin z cos x, cos z cos x, sin x)
    const double level = std::hypot(axis[0], axis[1]);
    const double turnZ = level < kQuarterTurn ? 0.0 : angle(axis[1], -axis[0]);
    return {angle(level, axis[2]), 0.0, turnZ};
  }
  // (sin y cos x, -sin x, cos y cos x), where the cosine of Y is not negative.
  const double level = std::hypot(axis[0], axis[2]);
  const double side = axis[2] < 0.0 ? -1.0 : 1.0;
  const double turnY = level < kQuarterTurn ? 0.0 : angle(side * axis[2], side * axis[0]);
  return {angle(side * level, -axis[1]), turnY, 0.0};
}

Triple anglesOfAny(Axes axes) {
  std::size_t missing = 0;
  std::size_t known = 0;
  std::size_t count = 0;
  for (std::size_t axis = 0; axis < kAxes; ++axis) {
    if (isMissing(axes[axis])) {
      missing = axis;
      ++count;
    } else {
      known = axis;
    }
  }
  if (count == kAxes) return {};
  if (count == kAxes - 1) return anglesOfOne(known, axes[known]);
  if (count == 1) {
    // Axes of the smallest doubles are hardly at right angles.
    axes[missing] = cross(axes[(missing + 1) % kAxes], axes[(missing + 2) % kAxes]);
    takeLength(&axes[missing]);
  }
  return anglesOf(axes);
}

}  // namespace

Matrix identity() {
  Matrix matrix{};
  for (std::size_t i = 0; i < matrix.size(); ++i) matrix[i][i] = 1.0;
  return matrix;
}

Matrix translation(const Triple& by) {
  Matrix matrix = identity();
  for (std::size_t axis = 0; axis < kAxes; ++axis) matrix[axis][kAxes] = by[axis];
  return matrix;
}

Matrix scaling(const Triple& by) {
  Matrix matrix = identity();
  for (std::size_t axis = 0; axis < kAxes; ++axis) matrix[axis][axis] = by[axis];
  return matrix;
}

Matrix rotation(std::size_t axis, double angle) {
  const double c = std::cos(angle);
  const double s = std::sin(angle);
  Matrix matrix = identity();
  // Each carries the next coordinate axis towards the one after it: X does Y to Z, Y does Z to X, Z does X to
  // Y.
  switch (axis) {
    case 0:
      matrix[1] = {0.0, c, -s, 0.0};
      matrix[2] = {0.0, s, c, 0.0};
      break;
    case 1:
      matrix[0] = {c, 0.0, s, 0.0};
      matrix[2] = {-s, 0.0, c, 0.0};
      break;
    default:
      matrix[0] = {c, -s, 0.0, 0.0};
      matrix[1] = {s, c, 0.0, 0.0};
      break;
  }
  return matrix;
}

Matrix after(const Matrix& second, const Matrix& first) {
  Matrix both{};
  for (std::size_t row = 0; row < both.size(); ++row) {
    for (std::size_t column = 0; column < both.size(); ++column) {
      for (std::size_t i = 0; i < both.size(); ++i) both[row][column] += second[row][i] * first[i][column];
    }
  }
  return both;
}

std::optional<Parts> takeApart(const Matrix& matrix) {
  for (const auto& row : matrix) {
    if (!std::all_of(row.begin(), row.end(), [](double value) { return std::isfinite(value); })) return {};
  }
  Parts parts;
  Axes axes{};
  for (std::size_t axis = 0; axis < kAxes; ++axis) {
    parts.translation[axis] = unsignedZero(matrix[axis][kAxes]);
    for (std::size_t row = 0; row < kAxes; ++row) axes[axis][row] = matrix[row][axis];
    parts.scale[axis] = takeLength(&axes[axis]);
  }
  if (dot(axes[0], cross(axes[1], axes[2])) < 0.0) {
    parts.scale[0] = -parts.scale[0];
    for (double& component : axes[0]) component = -component;
  }
  parts.rotation = anglesOfAny(axes);
  return parts;
}

}  // namespace secondreader

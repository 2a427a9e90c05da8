#include "motion/Matrix.h"

#include <algorithm>

namespace motion {
namespace {

// A direction at right angles to a unit vector.
Vector AnySquare(const Vector& unit) {
  const bool awayFromX = std::fabs(unit.x) < 0.5;
  Vector square = Cross(unit, awayFromX ? Vector{1.0, 0.0, 0.0} : Vector{0.0, 1.0, 0.0});
  Normalise(&square);
  return square;
}

// Replaces the vector by the direction of its part at right angles to a unit vector. Done twice, because the
// first difference has the rounding of a long vector.
bool NormaliseSquareTo(const Vector& unit, Vector* vector) {
  if (!Normalise(vector)) return false;
  for (int round = 0; round < 2; ++round) {
    *vector = *vector - unit * Dot(*vector, unit);
    constexpr double kParallel = 1e-14;
    if (Length(*vector) < kParallel || !Normalise(vector)) return false;
  }
  return true;
}

}  // namespace

bool Normalise(Vector* vector) {
  const double length = Length(*vector);
  if (!(length > 0.0) || !std::isfinite(length)) return false;
  *vector = {vector->x / length, vector->y / length, vector->z / length};
  return true;
}

bool IsFinite(const Vector& vector) {
  return std::isfinite(vector.x) && std::isfinite(vector.y) && std::isfinite(vector.z);
}

bool IsFinite(const Matrix& matrix) {
  return IsFinite(matrix.x) && IsFinite(matrix.y) && IsFinite(matrix.z) && IsFinite(matrix.origin);
}

double Determinant(const Matrix& matrix) { return Dot(matrix.x, Cross(matrix.y, matrix.z)); }

bool Invert(const Matrix& matrix, Matrix* inverse) {
  const double volume = Determinant(matrix);
  if (volume == 0.0 || !std::isfinite(1.0 / volume)) return false;
  const double share = 1.0 / volume;
  const Vector a = Cross(matrix.y, matrix.z) * share;
  const Vector b = Cross(matrix.z, matrix.x) * share;
  const Vector c = Cross(matrix.x, matrix.y) * share;
  Matrix result{{a.x, b.x, c.x}, {a.y, b.y, c.y}, {a.z, b.z, c.z}, {}};
  result.origin = -TransformDirection(matrix.origin, result);
  if (!IsFinite(result)) return false;
  *inverse = result;
  return true;
}

Matrix RotationOf(const Matrix& matrix) {
  Matrix turned = WithoutOrigin(matrix);
  const bool hasX = Normalise(&turned.x);
  const bool hasY = Normalise(&turned.y);
  const bool hasZ = Normalise(&turned.z);
  if (!hasX && !hasY && !hasZ) return {};
  if (!hasX) {
    turned.x = Cross(turned.y, turned.z);
    const bool square = hasY && hasZ && Normalise(&turned.x);
    if (!square) turned.x = AnySquare(hasY ? turned.y : turned.z);
  }
  if (!hasY || !NormaliseSquareTo(turned.x, &turned.y)) {
    const bool square = hasZ && NormaliseSquareTo(turned.x, &turned.z);
    turned.y = square ? Cross(turned.z, turned.x) : AnySquare(turned.x);
  }
  turned.z = Cross(turned.x, turned.y);
  return turned;
}

}  // namespace motion

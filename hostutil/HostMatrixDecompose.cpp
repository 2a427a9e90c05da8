// Taking a matrix apart: lengths of the axes, then the angles of their directions.
#include <algorithm>
#include <array>
#include <cmath>
#include <limits>

#include "hostapi/ErrorCodes.h"
#include "hostutil/HostMatrix.h"
#include "hostutil/HostMatrixInternal.h"
#include "hostutil/RehearsalInternal.h"

using namespace hostutil::matrix;

namespace {

constexpr double kHalfTurn = 3.141592653589793;

// Below this cosine of the Y angle the X and Z angles turn about one line.
constexpr double kPoleCosine = 1e-9;

// Two axes closer to one line than this sine do not determine the third.
constexpr double kParallelSine = 1e-9;

using Vector = std::array<double, kAxes>;

// The directions of the axes: columns of a rotation, each of length 1, but {0, 0, 0} where an axis has none.
using Basis = std::array<Vector, kAxes>;

bool IsZero(const Vector& v) { return v[0] == 0.0 && v[1] == 0.0 && v[2] == 0.0; }

Vector Negated(const Vector& v) { return {-v[0], -v[1], -v[2]}; }

Vector Cross(const Vector& a, const Vector& b) {
  return {a[1] * b[2] - a[2] * b[1], a[2] * b[0] - a[0] * b[2], a[0] * b[1] - a[1] * b[0]};
}

double Dot(const Vector& a, const Vector& b) { return a[0] * b[0] + a[1] * b[1] + a[2] * b[2]; }

// Makes the vector one of length 1 and returns the length that it had. A length beyond the largest double is
// held there. A zero vector stays.
[[gnu::noinline]] double NormaliseExtreme(Vector* v) {
  const double largest = std::max({std::abs((*v)[0]), std::abs((*v)[1]), std::abs((*v)[2])});
  if (largest == 0.0) return 0.0;
  for (double& component : *v) component /= largest;
  const double length = std::sqrt(Dot(*v, *v));
  for (double& component : *v) component /= length;
  return std::min(largest * length, std::numeric_limits<double>::max());
}

// The same for vectors whose squares neither overflow nor are lost, which nearly all are.
inline double Normalise(Vector* v) {
  constexpr double kSmallSquare = 1e-200;
  constexpr double kLargeSquare = 1e200;
  const double square = Dot(*v, *v);
  if (!(square > kSmallSquare && square < kLargeSquare)) return NormaliseExtreme(v);
  if (square == 1.0) return 1.0;
  const double length = std::sqrt(square);
  const double inverse = 1.0 / length;
  for (double& component : *v) component *= inverse;
  return length;
}

// An angle or coordinate of -0 becomes 0, so that it cannot choose between half a turn and minus half a turn.
double WithoutNegativeZero(double value) { return value + 0.0; }

// 0 times a value that is not finite is NaN, and so is every sum with it.
bool IsFinite(const TransformMatrix& matrix) {
  Row zero{};
  for (const auto& row : matrix.m) {
    zero = Sum(zero, Product(0.0, Load(row)));
  }
  return zero.left[0] + zero.left[1] + zero.right[0] + zero.right[1] == 0.0;
}

// Adds an axis at right angles to the only one that is known. It is chosen so that the angles which the known
// axis leaves open become 0: X where x is known, Y where y is, Z where z is.
void AddPerpendicular(int known, Basis* basis) {
  const Vector& axis = (*basis)[static_cast<std::size_t>(known)];
  Vector other{};
  switch (known) {
    case 0:
      other = {-axis[1], axis[0], 0.0};
      break;
    case 1:
      other = {axis[1], -axis[0], 0.0};
      break;
    default:
      other = {std::abs(axis[2]), 0.0, axis[2] < 0.0 ? axis[0] : -axis[0]};
      break;
  }
  const std::size_t added = known == 0 ? 1 : 0;
  if (Normalise(&other) < kPoleCosine) {
    other = Vector{};
    other[added] = 1.0;
  }
  (*basis)[added] = other;
}

// The next axis, in the cycle x, y, z.
std::size_t Next(std::size_t axis) { return (axis + 1) % kAxes; }

// Gives the axis that is missing the direction at right angles to the two others. False when these lie on one
// line.
bool CompleteThird(std::size_t missing, Basis* basis) {
  const std::size_t second = Next(missing);
  Vector cross = Cross((*basis)[second], (*basis)[Next(second)]);
  if (Normalise(&cross) < kParallelSine) return false;
  (*basis)[missing] = cross;
  return true;
}

// Gives every axis a direction.
void Complete(Basis* basis) {
  if (!IsZero((*basis)[0]) && !IsZero((*basis)[1]) && !IsZero((*basis)[2])) return;
  std::array<bool, kAxes> has{};
  for (std::size_t i = 0; i < kAxes; ++i) has[i] = !IsZero((*basis)[i]);
  const auto known = std::count(has.begin(), has.end(), true);
  if (known == 0) {
    *basis = {Vector{1.0, 0.0, 0.0}, Vector{0.0, 1.0, 0.0}, Vector{0.0, 0.0, 1.0}};
    return;
  }
  const auto missing = static_cast<std::size_t>(std::find(has.begin(), has.end(), false) - has.begin());
  if (known == 2 && CompleteThird(missing, basis)) return;
  const auto first = static_cast<std::size_t>(std::find(has.begin(), has.end(), true) - has.begin());
  AddPerpendicular(static_cast<int>(first), basis);
  CompleteThird(first == 2 ? 1 : 2, basis);
}

// The angle of a direction from x towards y. Without a y it needs no arc tangent; of a node that turns about
// one axis only, two of the three angles are so.
double AngleOf(double y, double x) {
  const double up = WithoutNegativeZero(y);
  if (up == 0.0) return x < 0.0 ? kHalfTurn : 0.0;
  return std::atan2(up, x);
}

// X, Y and Z so that Rz·Ry·Rx turns the coordinate axes into the basis. X is measured after Y and Z are
// undone: near the pole X and Z are uncertain each alone, and this keeps their sum right.
void AnglesOf(const Basis& basis, double rotation[kAxes]) {
  const auto& [x, y, z] = basis;
  // An axis without a y needs no root: its length is that of the x.
  const bool flat = x[1] == 0.0;
  const double cosineY = flat ? std::abs(x[0]) : std::sqrt(x[0] * x[0] + x[1] * x[1]);
  double c = 1.0;
  double s = 0.0;
  rotation[2] = 0.0;
  if (cosineY >= kPoleCosine) {
    rotation[2] = AngleOf(x[1], x[0]);
    c = flat ? std::copysign(1.0, x[0]) : x[0] / cosineY;
    s = flat ? 0.0 : x[1] / cosineY;
  }
  rotation[0] = AngleOf(s * z[0] - c * z[1], c * y[1] - s * y[0]);
  rotation[1] = AngleOf(-x[2], cosineY);
}

}  // namespace

HostError hostutil::matrix::Decompose(const TransformMatrix& matrix, MatrixComponents* components) {
  if (!IsFinite(matrix)) {
    *components = MatrixComponents{};
    return HOST_ERR_MATRIX_NOT_FINITE;
  }
  // Loaded by rows, in the pairs that they were stored in: a load across two stores stalls the processor.
  const Row rows[] = {Load(matrix.m[0]), Load(matrix.m[1]), Load(matrix.m[2])};
  Basis basis;
  for (std::size_t row = 0; row < kAxes; ++row) {
    basis[0][row] = rows[row].left[0];
    basis[1][row] = rows[row].left[1];
    basis[2][row] = rows[row].right[0];
    components->translation[row] = WithoutNegativeZero(rows[row].right[1]);
    components->shear[row] = 0.0;
  }
  components->scale[0] = Normalise(&basis[0]);
  components->scale[1] = Normalise(&basis[1]);
  components->scale[2] = Normalise(&basis[2]);
  if (Dot(basis[0], Cross(basis[1], basis[2])) < 0.0) {
    components->scale[0] = -components->scale[0];
    basis[0] = Negated(basis[0]);
  }
  Complete(&basis);
  AnglesOf(basis, components->rotation);
  return HOST_ERR_NONE;
}

HostError MatrixDecompose(const TransformMatrix* matrix, MatrixComponents* components, void* /*options*/) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_MatrixDecompose, &code)) {
    hostutil::HandOutNothing(components);
    return code;
  }
  if (components == nullptr) return HOST_ERR_UTILITY_NULL;
  if (matrix == nullptr) {
    *components = MatrixComponents{};
    return HOST_ERR_UTILITY_NULL;
  }
  return hostutil::matrix::Decompose(*matrix, components);
}

#include "export/Matrix.h"

#include <cmath>
#include <cstddef>
#include <numbers>

namespace interchange {
namespace {

constexpr double kRadians = std::numbers::pi / 180.0;
// The sines and cosines of right angles are exact.
constexpr double kQuarters[] = {0.0, 1.0, 0.0, -1.0};

struct SineAndCosine {
  double sine;
  double cosine;
};

SineAndCosine Turn(double degrees) {
  const double whole = std::fmod(degrees, 360.0);
  const double quarter = whole / 90.0;
  if (quarter == std::floor(quarter)) {
    const int index = (static_cast<int>(quarter) + 4) % 4;
    return {kQuarters[index], kQuarters[(index + 1) % 4]};
  }
  return {std::sin(whole * kRadians), std::cos(whole * kRadians)};
}

// About one axis: 0, 1, 2 for x, y, z.
Matrix RotationAbout(std::size_t axis, double degrees) {
  const SineAndCosine turn = Turn(degrees);
  const std::size_t from = (axis + 1) % 3, to = (axis + 2) % 3;
  Matrix matrix;
  matrix.cell[from][from] = matrix.cell[to][to] = turn.cosine;
  matrix.cell[to][from] = turn.sine;
  matrix.cell[from][to] = -turn.sine;
  return matrix;
}

bool IsNothing(const Vector& a) { return a == Vector{}; }

// Of length 1 and square to `a`, which is of length 1.
Vector SomeSquareTo(const Vector& a) {
  const Vector other = std::fabs(a.x) < 0.5 ? Vector{1.0, 0.0, 0.0} : Vector{0.0, 1.0, 0.0};
  return Normalised(other - a * Dot(a, other));
}

struct Order {
  std::size_t first, second, third;
  double sign;  // of the cycle that the three make
};

Order OrderOf(RotationOrder order) {
  switch (order) {
    case RotationOrder::XYZ:
      return {0, 1, 2, 1.0};
    case RotationOrder::XZY:
      return {0, 2, 1, -1.0};
    case RotationOrder::YXZ:
      return {1, 0, 2, -1.0};
    case RotationOrder::YZX:
      return {1, 2, 0, 1.0};
    case RotationOrder::ZXY:
      return {2, 0, 1, 1.0};
    case RotationOrder::ZYX:
      break;
  }
  return {2, 1, 0, -1.0};
}

double Component(const Vector& a, std::size_t axis) { return axis == 0 ? a.x : axis == 1 ? a.y : a.z; }

Vector FromOrder(const Order& order, const std::array<double, 3>& angles) {
  std::array<double, 3> byAxis{};
  byAxis[order.first] = angles[0];
  byAxis[order.second] = angles[1];
  byAxis[order.third] = angles[2];
  return {byAxis[0], byAxis[1], byAxis[2]};
}

// The angle, shifted by whole turns so that it is nearest to `near`.
double NearestTurn(double degrees, double near) {
  const double turns = std::nearbyint((near - degrees) / 360.0);
  return std::isfinite(turns) ? degrees + turns * 360.0 : degrees;
}

Vector NearestTurns(const Vector& angles, const Vector& near) {
  return {NearestTurn(angles.x, near.x), NearestTurn(angles.y, near.y), NearestTurn(angles.z, near.z)};
}

double Distance(const Vector& a, const Vector& b) {
  return std::fabs(a.x - b.x) + std::fabs(a.y - b.y) + std::fabs(a.z - b.z);
}

}  // namespace

double Length(const Vector& a) { return std::hypot(a.x, a.y, a.z); }

Vector Normalised(const Vector& a) {
  const double length = Length(a);
  if (!(length > 0.0) || !std::isfinite(length)) return {};
  // Numbers as small as these have lost digits, and so has their length: they are scaled up first.
  if (length < 0x1p-900) return Normalised(a * 0x1p500);
  return {a.x / length, a.y / length, a.z / length};
}

bool IsFinite(const Vector& a) { return std::isfinite(a.x) && std::isfinite(a.y) && std::isfinite(a.z); }

Vector Matrix::Column(int column) const {
  const auto at = static_cast<std::size_t>(column);
  return {cell[0][at], cell[1][at], cell[2][at]};
}

void Matrix::SetColumn(int column, const Vector& vector) {
  const auto at = static_cast<std::size_t>(column);
  cell[0][at] = vector.x;
  cell[1][at] = vector.y;
  cell[2][at] = vector.z;
}

Matrix operator*(const Matrix& a, const Matrix& b) {
  Matrix product;
  for (std::size_t row = 0; row < 3; ++row) {
    for (std::size_t column = 0; column < 4; ++column) {
      double sum = column == 3 ? a.cell[row][3] : 0.0;
      for (std::size_t i = 0; i < 3; ++i) sum += a.cell[row][i] * b.cell[i][column];
      product.cell[row][column] = sum;
    }
  }
  return product;
}

Vector TransformPoint(const Matrix& matrix, const Vector& point) {
  return matrix.Column(0) * point.x + matrix.Column(1) * point.y + matrix.Column(2) * point.z +
         matrix.Column(3);
}

bool IsFinite(const Matrix& matrix) {
  for (int column = 0; column < 4; ++column) {
    if (!IsFinite(matrix.Column(column))) return false;
  }
  return true;
}

Matrix RotationMatrix(const Vector& degrees) {
  return RotationAbout(2, degrees.z) * RotationAbout(1, degrees.y) * RotationAbout(0, degrees.x);
}

Matrix RotationMatrix(const Quaternion& q) {
  Matrix matrix;
  matrix.SetColumn(
      0, {1 - 2 * (q.y * q.y + q.z * q.z), 2 * (q.x * q.y + q.z * q.w), 2 * (q.x * q.z - q.y * q.w)});
  matrix.SetColumn(
      1, {2 * (q.x * q.y - q.z * q.w), 1 - 2 * (q.x * q.x + q.z * q.z), 2 * (q.y * q.z + q.x * q.w)});
  matrix.SetColumn(
      2, {2 * (q.x * q.z + q.y * q.w), 2 * (q.y * q.z - q.x * q.w), 1 - 2 * (q.x * q.x + q.y * q.y)});
  return matrix;
}

Matrix Scaling(const Vector& by) {
  Matrix matrix;
  matrix.cell[0][0] = by.x;
  matrix.cell[1][1] = by.y;
  matrix.cell[2][2] = by.z;
  return matrix;
}

Matrix RigidOf(const Matrix& matrix) {
  Vector x = Normalised(matrix.Column(0));
  Vector y = Normalised(matrix.Column(1));
  Vector z = Normalised(matrix.Column(2));
  if (IsNothing(x)) x = Normalised(Cross(y, z));
  if (IsNothing(x))
    x = !IsNothing(y) ? SomeSquareTo(y) : !IsNothing(z) ? SomeSquareTo(z) : Vector{1.0, 0.0, 0.0};
  y = Normalised(y - x * Dot(x, y));
  if (IsNothing(y)) y = Normalised(Cross(z, x));
  if (IsNothing(y)) y = SomeSquareTo(x);
  z = Normalised(Cross(x, y));
  Matrix rigid;
  rigid.SetColumn(0, x);
  rigid.SetColumn(1, Cross(z, x));
  rigid.SetColumn(2, z);
  rigid.SetColumn(3, matrix.Column(3));
  return rigid;
}

Quaternion QuaternionOf(const Matrix& rotation) {
  const auto& m = rotation.cell;
  // Starts from the largest of the four parts, so that nothing is divided by a small one.
  const std::array<double, 4> squares = {1 + m[0][0] - m[1][1] - m[2][2], 1 - m[0][0] + m[1][1] - m[2][2],
                                         1 - m[0][0] - m[1][1] + m[2][2], 1 + m[0][0] + m[1][1] + m[2][2]};
  std::size_t largest = 3;
  for (std::size_t i = 0; i < 3; ++i) {
    if (squares[i] > squares[largest]) largest = i;
  }
  const double xy = m[1][0] + m[0][1], xz = m[0][2] + m[2][0], yz = m[2][1] + m[1][2];
  const double wx = m[2][1] - m[1][2], wy = m[0][2] - m[2][0], wz = m[1][0] - m[0][1];
  const std::array<Quaternion, 4> forms = {
      Quaternion{squares[0], xy, xz, wx}, Quaternion{xy, squares[1], yz, wy},
      Quaternion{xz, yz, squares[2], wz}, Quaternion{wx, wy, wz, squares[3]}};
  const Quaternion& form = forms[largest];
  const double length = std::sqrt(form.x * form.x + form.y * form.y + form.z * form.z + form.w * form.w);
  const double factor = (form.w < 0.0 ? -1.0 : 1.0) / length;
  return {form.x * factor, form.y * factor, form.z * factor, form.w * factor};
}

Quaternion Nearest(const Quaternion& q, const Quaternion& to) {
  const double along = q.x * to.x + q.y * to.y + q.z * to.z + q.w * to.w;
  return along < 0.0 ? Quaternion{-q.x, -q.y, -q.z, -q.w} : q;
}

Vector AnglesOf(const Matrix& rotation, RotationOrder name, const Vector& near) {
  const Order order = OrderOf(name);
  const auto& m = rotation.cell;
  const double sign = order.sign;
  // With the axes renamed to 0, 1, 2 in their order, the matrix is R2·R1·R0.
  const double sine = -sign * m[order.third][order.first];
  const double cosine = std::hypot(m[order.first][order.first], m[order.second][order.first]);
  const double second = std::atan2(sine, cosine) / kRadians;
  constexpr double kPole = 1e-9;
  if (cosine < kPole) {
    const double third = Component(near, order.third);
    const SineAndCosine turn = Turn(third);
    // Column `second` of the matrix with the third turn taken back.
    const double up =
        m[order.second][order.second] * turn.cosine - sign * m[order.first][order.second] * turn.sine;
    const double over =
        m[order.second][order.third] * turn.cosine - sign * m[order.first][order.third] * turn.sine;
    const double first = std::atan2(-sign * over, up) / kRadians;
    return NearestTurns(FromOrder(order, {first, second, third}), near);
  }
  const double first =
      std::atan2(sign * m[order.third][order.second], m[order.third][order.third]) / kRadians;
  const double third =
      std::atan2(sign * m[order.second][order.first], m[order.first][order.first]) / kRadians;
  const Vector one = NearestTurns(FromOrder(order, {first, second, third}), near);
  const Vector other = NearestTurns(FromOrder(order, {first + 180.0, 180.0 - second, third + 180.0}), near);
  return Distance(other, near) < Distance(one, near) ? other : one;
}

}  // namespace interchange

// Points, rotations and matrices of a description.
//
// Matrices act on column vectors: a point p becomes M·p, and in A·B what B does comes first. The linear part
// of a transform is Rz·Ry·Rx·S. Right-handed. Doubles throughout.
#pragma once

#include <array>

namespace interchange {

struct Vector {
  double x = 0.0;
  double y = 0.0;
  double z = 0.0;

  friend bool operator==(const Vector&, const Vector&) = default;
};

inline Vector operator+(const Vector& a, const Vector& b) { return {a.x + b.x, a.y + b.y, a.z + b.z}; }
inline Vector operator-(const Vector& a, const Vector& b) { return {a.x - b.x, a.y - b.y, a.z - b.z}; }
inline Vector operator*(const Vector& a, double factor) { return {a.x * factor, a.y * factor, a.z * factor}; }
inline double Dot(const Vector& a, const Vector& b) { return a.x * b.x + a.y * b.y + a.z * b.z; }
inline Vector Cross(const Vector& a, const Vector& b) {
  return {a.y * b.z - a.z * b.y, a.z * b.x - a.x * b.z, a.x * b.y - a.y * b.x};
}
double Length(const Vector& a);      // no overflow and no underflow on the way
Vector Normalised(const Vector& a);  // of length 1; (0, 0, 0) where the length is 0 or not finite
bool IsFinite(const Vector& a);

// A rotation: x, y, z and the real part, of length 1.
struct Quaternion {
  double x = 0.0;
  double y = 0.0;
  double z = 0.0;
  double w = 1.0;

  friend bool operator==(const Quaternion&, const Quaternion&) = default;
};

// cell[row][column]; the last row of a transform is 0 0 0 1.
struct Matrix {
  std::array<std::array<double, 4>, 4> cell{{{1, 0, 0, 0}, {0, 1, 0, 0}, {0, 0, 1, 0}, {0, 0, 0, 1}}};

  // Where a unit axis goes (0, 1, 2), and the origin (3).
  Vector Column(int column) const;
  void SetColumn(int column, const Vector& vector);

  friend bool operator==(const Matrix&, const Matrix&) = default;
};

Matrix operator*(const Matrix& a, const Matrix& b);  // first b, then a
Vector TransformPoint(const Matrix& matrix, const Vector& point);
bool IsFinite(const Matrix& matrix);

// Degrees, applied about x, then y, then z.
Matrix RotationMatrix(const Vector& degrees);
Matrix RotationMatrix(const Quaternion& rotation);
Matrix Scaling(const Vector& by);

// The place, and axes of length 1 that are square to each other and right-handed. The first axis keeps its
// direction and the second its plane. An axis of length 0 follows from the others.
Matrix RigidOf(const Matrix& matrix);

// Of a matrix whose linear part is a rotation; the real part is not negative.
Quaternion QuaternionOf(const Matrix& rotation);

// The same rotation with the sign that is nearer to `to`, so that the way between the two is the short one.
Quaternion Nearest(const Quaternion& rotation, const Quaternion& to);

// The order of the turns: XYZ turns about x first, and is Rz·Ry·Rx.
enum class RotationOrder { XYZ, XZY, YXZ, YZX, ZXY, ZYX };

// The angles of a rotation in degrees, about x, y and z whatever the order: of all angles that give it, those
// nearest to `near`. Where the second angle of the order is 90° only the sum or the difference of the others
// is fixed: the last one is then that of `near`.
Vector AnglesOf(const Matrix& rotation, RotationOrder order, const Vector& near);

}  // namespace interchange

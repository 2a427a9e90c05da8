// Points and matrices, as a scene writes them.
//
// Row vectors: a point p becomes p·M, and A·B applies A first. The rows of a matrix are the images of the
// unit axes; the last one is the image of the origin. Right-handed. The last column is always 0 0 0 1 and is
// not stored.
#pragma once

#include <cmath>

namespace motion {

struct Vector {
  double x = 0.0;
  double y = 0.0;
  double z = 0.0;

  // 0, 1, 2: x, y, z.
  double& operator[](int axis) { return axis == 0 ? x : axis == 1 ? y : z; }
  double operator[](int axis) const { return axis == 0 ? x : axis == 1 ? y : z; }

  friend bool operator==(const Vector&, const Vector&) = default;
};

inline Vector operator+(const Vector& a, const Vector& b) { return {a.x + b.x, a.y + b.y, a.z + b.z}; }
inline Vector operator-(const Vector& a, const Vector& b) { return {a.x - b.x, a.y - b.y, a.z - b.z}; }
inline Vector operator-(const Vector& a) { return {-a.x, -a.y, -a.z}; }
inline Vector operator*(const Vector& a, double factor) { return {a.x * factor, a.y * factor, a.z * factor}; }
inline double Dot(const Vector& a, const Vector& b) { return a.x * b.x + a.y * b.y + a.z * b.z; }
inline Vector Cross(const Vector& a, const Vector& b) {
  return {a.y * b.z - a.z * b.y, a.z * b.x - a.x * b.z, a.x * b.y - a.y * b.x};
}
// Without overflow or underflow in between.
inline double Length(const Vector& a) { return std::hypot(a.x, a.y, a.z); }

struct Matrix {
  Vector x{1.0, 0.0, 0.0};
  Vector y{0.0, 1.0, 0.0};
  Vector z{0.0, 0.0, 1.0};
  Vector origin;

  Vector& Axis(int axis) { return axis == 0 ? x : axis == 1 ? y : z; }
  const Vector& Axis(int axis) const { return axis == 0 ? x : axis == 1 ? y : z; }

  friend bool operator==(const Matrix&, const Matrix&) = default;
};

inline Vector TransformDirection(const Vector& a, const Matrix& m) {
  return m.x * a.x + m.y * a.y + m.z * a.z;
}
inline Vector TransformPoint(const Vector& a, const Matrix& m) { return TransformDirection(a, m) + m.origin; }

// First a, then b.
inline Matrix operator*(const Matrix& a, const Matrix& b) {
  return {TransformDirection(a.x, b), TransformDirection(a.y, b), TransformDirection(a.z, b),
          TransformPoint(a.origin, b)};
}

inline Matrix Translation(const Vector& by) {
  Matrix matrix;
  matrix.origin = by;
  return matrix;
}

inline Matrix Scaling(const Vector& by) { return {{by.x, 0.0, 0.0}, {0.0, by.y, 0.0}, {0.0, 0.0, by.z}, {}}; }

inline Matrix WithoutOrigin(Matrix matrix) {
  matrix.origin = {};
  return matrix;
}

// Rows and columns exchanged, without the origin: the inverse of a rotation.
inline Matrix Transposed(const Matrix& m) {
  return {{m.x.x, m.y.x, m.z.x}, {m.x.y, m.y.y, m.z.y}, {m.x.z, m.y.z, m.z.z}, {}};
}

// Gives the vector length 1. False, and the vector is unchanged, where its length is 0 or not finite.
bool Normalise(Vector* vector);

bool IsFinite(const Vector& vector);
bool IsFinite(const Matrix& matrix);

// The volume of the unit cube's image; negative where the matrix mirrors.
double Determinant(const Matrix& matrix);

// False where the matrix is flat or not finite; *inverse is then unchanged.
bool Invert(const Matrix& matrix, Matrix* inverse);

// The rotation nearest to the axes: at right angles, of length 1, right-handed. The first axis keeps its
// direction, the second one its plane with the first. An axis of length 0 is completed from the others.
Matrix RotationOf(const Matrix& matrix);

}  // namespace motion
